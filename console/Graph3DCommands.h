#pragma once
// What a mouse does to the three-dimensional graph, by lines of text.

#include <string>
#include <string_view>

#include "platform/Graph3D.h"

namespace zel {

/// Runs "rotate3d", "zoom3d", "pan3d", "click3d" or "place3d" with its numbers. False for another
/// word; `problem` takes what was wrong with the numbers.
bool runGraph3DCommand(Graph3D& graph, std::string_view word, std::string_view numbers,
                       std::string& problem);

}  // namespace zel
