#pragma once
// What a mouse does to the graphs, by lines of text.

#include <string>
#include <string_view>

#include "platform/Graph.h"
#include "platform/Graph3D.h"

namespace zel {

/// Runs "rotate3d", "zoom3d", "pan3d", "click3d" or "place3d" with its numbers. False for another
/// word; `problem` takes what was wrong with the numbers.
bool runGraph3DCommand(Graph3D& graph, std::string_view word, std::string_view numbers,
                       std::string& problem);

/// The same for the graph of the panel: "move2d INDEX X Y" drags a cursor (from 1) to a point of
/// the trace, "zoom2d LEFT RIGHT BOTTOM TOP" draws a zoom rectangle, in the units of the axes.
bool runGraphCommand(Graph& graph, std::string_view word, std::string_view numbers,
                     std::string& problem);

}  // namespace zel
