#pragma once
// What the trace tools draw over the graph: host traces, limits, host markers, verdicts.

#include <qcustomplot.h>

#include <cstddef>
#include <vector>

namespace zel {

struct OverlayCurve {
    QVector<double> x;  ///< on the graph's axes
    QVector<double> y;
    QColor color;
    bool dashed = false;
};

struct OverlayMarker {
    double x = 0;
    double y = 0;
    int number = 0;  ///< from 1
};

struct OverlayPicture {
    std::vector<OverlayCurve> curves;
    std::vector<OverlayMarker> markers;
    QString foot;  ///< verdict and corrections, at the lower left
    bool failed = false;
    bool empty() const {
        return curves.empty() && markers.empty() && foot.isEmpty() && notice.isEmpty();
    }
    QString notice;  ///< what ended, at the top
};

/// Pale blues, one a host trace.
QColor hostTraceColor(std::size_t place);
QColor limitColor();

/// The items belong to the plot; all of them lie under the live trace.
class TraceOverlay {
  public:
    /// `paper`: for a light ground.
    explicit TraceOverlay(QCustomPlot& plot, bool paper = false);
    /// Replaces what is shown; the caller replots.
    void show(const OverlayPicture& picture);
    /// Ends the curves at the edges of the graticule, for pictures whose format has no clip.
    void clipToView();

  private:
    void build();
    QColor ink(const QColor& color) const;

    QCustomPlot& plot_;
    bool paper_;
    std::vector<QCPGraph*> curves_;
    std::vector<QCPItemTracer*> points_;
    std::vector<QCPItemText*> labels_;
    QCPItemText* foot_ = nullptr;  ///< nothing is built before there is something to show
    QCPItemText* notice_ = nullptr;
};

}  // namespace zel
