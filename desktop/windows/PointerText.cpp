#include "desktop/windows/PointerText.h"

#include <cmath>
#include <optional>

#include "desktop/graph/AxisText.h"
#include "desktop/graph/GraphWidget.h"
#include "desktop/windows/Readouts.h"
#include "forms/ControllerForm.h"
#include "platform/Controls.h"
#include "platform/Graph.h"

namespace zel {

PointerText::PointerText(GraphWidget& graph, Readouts& readouts, ControllerForm& panel)
    : graph_(graph), readouts_(readouts), panel_(panel) {
    graph_.tracking = [this](bool before) { track(before); };
    graph_.pointed = [this](std::optional<double> x) {
        if (!x && !at_) return;
        at_ = x;
        if (!x) leave();
        show();
    };
}

void PointerText::track(bool before) {
    Label& label = panel_.DeltaLabel;
    if (!before) {
        written_ = label.Caption;
        return;
    }
    // A reading of the instrument has come since: that is what is to come back.
    if (lent_ && label.Caption.get() == written_) return;
    caption_ = label.Caption;
    ink_ = label.ForeColor;
    lent_ = true;
}

void PointerText::leave() {
    Label& label = panel_.DeltaLabel;
    if (lent_ && label.Caption.get() == written_) {
        label.Caption = caption_;
        label.ForeColor = ink_;
    }
    lent_ = false;
}

QString PointerText::levelAt(double x) const {
    const double high = graph_.picture().levelsAt(x).second;
    if (!std::isfinite(high)) return {};
    return QString::fromStdString(levelText(high, graph_.picture().view().unit));
}

void PointerText::show() {
    const GraphPlot& picture = graph_.picture();
    if (at_) {
        const QString level = levelAt(*at_);
        readouts_.showPointer(
            QString::fromStdString(axisText(*at_, picture.resolution(), picture.view().xUnit)),
            level.isEmpty() ? QString(QObject::tr("no sample")) : level);
    } else {
        readouts_.showPointer({}, {});
    }
    const Graph& graph = panel_.CWGraph1;
    const GraphCursor& marker = graph.cursor(1);
    const GraphCursor& delta = graph.cursor(2);
    QString atMarker;
    QString atDelta;
    const double level = picture.levelsAt(marker.X).second;
    if (marker.Visible && std::isfinite(level))
        atMarker = QString::fromStdString(levelText(level, picture.view().unit));
    const double other = picture.levelsAt(delta.X).second;
    if (delta.Visible && marker.Visible && std::isfinite(other - level))
        atDelta = QString::fromStdString(levelText(other - level, "dB"));
    readouts_.showTrace(atMarker, atDelta);
}

}  // namespace zel
