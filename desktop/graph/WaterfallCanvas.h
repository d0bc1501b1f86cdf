#pragma once
// The three-dimensional graph on the screen: drawing, mouse and keyboard.

#include <QTimer>
#include <QWidget>

#include "desktop/graph/GraphColors.h"
#include "forms/WaterfallForm.h"
#include "waterfall/WaterfallPicture.h"

namespace zel {

/// Left drag rotates, right drag or Shift with the left moves, the wheel zooms, a double click
/// resets. Arrows, Shift with arrows, plus, minus and Home do the same by the keyboard.
class WaterfallCanvas : public QWidget {
  public:
    explicit WaterfallCanvas(WaterfallForm& form, QWidget* parent = nullptr);

    /// The graph has changed: drawn with the next frame, if anyone sees it.
    void refresh();
    void setColors(const GraphColors& colors);
    /// A picture that rests is drawn once more without steps at its edges.
    void setStillAfter(int milliseconds) { still_.setInterval(milliseconds); }
    /// How many pictures of the rows were computed so far.
    int drawings() const { return drawings_; }

  protected:
    void paintEvent(QPaintEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void leaveEvent(QEvent* event) override;

  private:
    enum class Drag { None, Rotate, Move };

    void rotate(double right, double down);
    void move(double right, double down);
    void zoom(double factor);
    void readPointer();
    bool placesCursors() const;
    const WaterfallPicture& picture(double fontHeight);

    WaterfallForm& form_;
    GraphColors colors_;
    Drag drag_ = Drag::None;
    bool moved_ = false;
    QPointF last_;
    QPointF pointer_;
    QTimer pointerRead_;
    QTimer wheelEnd_;
    QTimer rest_;         ///< after a picture, so that sweeps have the processor as well
    bool waits_ = false;  ///< a change came meanwhile
    WaterfallPicture picture_;
    PictureStyle pictureStyle_;  ///< of `picture_`, and its size
    QSize pictureSize_;
    bool changed_ = true;  ///< since `picture_`
    QTimer still_;
    bool fine_ = false;  ///< the picture rests
    int drawings_ = 0;
};

}  // namespace zel
