#pragma once
// The menu of the graph.

#include <QPoint>
#include <functional>

#include "desktop/binders/Binder.h"
#include "desktop/graph/GraphNavigator.h"
#include "desktop/graph/GraphWidget.h"
#include "forms/ControllerForm.h"

namespace zel {

/// Shows the menu at a place of the screen and does what is chosen. `x` is the place on the axis.
void showGraphMenu(QPoint place, double x, GraphWidget& graph, GraphNavigator& navigator,
                   ControllerForm& panel, Binder& binder, const std::function<void()>& copyPicture);

}  // namespace zel
