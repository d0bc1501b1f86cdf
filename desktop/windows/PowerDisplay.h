#pragma once
// The power sensor's reading in large digits, with a bar and its history, in the graph's place.

#include <QWidget>
#include <deque>

#include "forms/ControllerForm.h"

namespace zel {

class PowerDisplay : public QWidget {
  public:
    PowerDisplay(ControllerForm& panel, QWidget* parent);

    /// Takes a reading over when there is a new one.
    void take();

  protected:
    void paintEvent(QPaintEvent* event) override;

  private:
    void drawBar(QPainter& painter, const QRectF& place) const;
    void drawHistory(QPainter& painter, const QRectF& place) const;

    ControllerForm& panel_;
    std::deque<double> history_;  ///< dBm, the newest last
};

}  // namespace zel
