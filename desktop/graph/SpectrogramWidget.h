#pragma once
// Earlier sweeps under the graph: a line of colours a sweep, the newest at the top.

#include <QPointer>
#include <QWidget>
#include <functional>
#include <utility>

#include "forms/Forms.h"
#include "waterfall/SpectrogramImage.h"
#include "waterfall/SweepHistory.h"

namespace zel {

/// The frequency axis is the graph's, place for place. The wheel and the arrow keys go back in
/// time, a click shows a sweep as the trace.
class SpectrogramWidget : public QWidget {
  public:
    /// `plotArea` gives the left and the right end of the graph's axis, in pixels of this widget.
    SpectrogramWidget(Forms& forms, SweepHistory& history,
                      std::function<std::pair<int, int>()> plotArea, QWidget* parent = nullptr);

    /// The rows or the axes have changed: drawn with the next frame, if anyone sees it.
    void refresh();
    /// How many sweeps the top row is older than the newest.
    int scrolled() const;

  protected:
    void paintEvent(QPaintEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;

  private:
    void scrollTo(long back);
    QRect area() const;
    int rowsShown() const;

    Forms& forms_;
    SweepHistory& history_;
    SpectrogramImage image_;
    std::function<std::pair<int, int>()> plotArea_;
    bool paused_ = false;    ///< as it was drawn last
    bool follows_ = true;    ///< the top row is the newest
    unsigned long top_ = 0;  ///< else the number of the row at the top
};

}  // namespace zel
