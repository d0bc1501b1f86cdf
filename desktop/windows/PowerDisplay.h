#pragma once
// The power sensor's reading in large digits, with a bar and its history, in the graph's place.

#include <QWidget>
#include <deque>
#include <string>

namespace zel {

class PowerDisplay : public QWidget {
  public:
    explicit PowerDisplay(QWidget* parent);

    /// A reading as the instrument has answered it, in dBm; what is no number counts as none.
    void take(const std::string& answer);
    /// The mode has ended: readings of another time are none of the next.
    void clear();
    /// dBm, the newest last; 300 at most.
    const std::deque<double>& history() const { return history_; }
    /// How many readings the width of the history stands for: the least of some round numbers that
    /// has room, so that few readings are no stub at the edge.
    std::size_t span() const;

  protected:
    void paintEvent(QPaintEvent* event) override;

  private:
    void drawBar(QPainter& painter, const QRectF& place) const;
    void drawHistory(QPainter& painter, const QRectF& place) const;

    std::deque<double> history_;
};

}  // namespace zel
