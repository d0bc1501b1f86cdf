#pragma once
// The graphs as text, for the program that draws them into files.
//
// docs/picture-data.md describes the form.

#include <string>

#include "forms/WaterfallForm.h"
#include "platform/Graph.h"
#include "trace/ViewAnnotations.h"
#include "waterfall/SweepHistory.h"
#include "waterfall/WaterfallPicture.h"

namespace zel {

/// The version of the form that is written.
inline constexpr int kPictureVersion = 1;

/// The graph with the texts around it.
std::string graphJson(const Graph& graph, const ViewAnnotations& view);
/// The rows in depth, with the ends of the colour bar.
std::string waterfallJson(const WaterfallForm& form, const PictureStyle& style);
/// The rows from above.
std::string spectrogramJson(const WaterfallForm& form, const SweepHistory& history);

}  // namespace zel
