#pragma once
// A picture of the graph as the desktop draws it, in a file.

#include <QSize>
#include <QString>

#include "desktop/graph/TraceOverlay.h"
#include "platform/Graph.h"
#include "trace/ViewAnnotations.h"

namespace zel {

/// The file's ending chooses the kind, its case does not matter: wmf, svg, pdf (drawings) or png
/// (twice `size` in dots). wmf and pdf are for paper and have light colours always. False with a
/// text in `error` when the kind is unknown, or when the file cannot be written; an older file of
/// that name is then left as it was. Needs a QApplication, and says so where there is none. `tools`
/// is drawn over the graph as on the screen.
bool saveGraphImage(const Graph& graph, const ViewAnnotations& view, const QString& path,
                    QString* error, QSize size = {1000, 620}, bool dark = true,
                    const OverlayPicture& tools = {});

}  // namespace zel
