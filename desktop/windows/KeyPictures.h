#pragma once
// The hard keys' pictures: symbols drawn as lines, in the ink of the key.

#include <QPushButton>

namespace zel {

/// Whether there is a symbol for a key of the image list, "freq_y" or "freq_b".
bool hasKeyPicture(const QString& picture);
/// Draws the symbol of a picture into a square, sharp at each scale of the screen.
void drawKeyPicture(QPainter& painter, const QString& picture, const QRectF& square,
                    const QColor& ink);

/// A key with its symbol above the caption. The symbol is that of the property "picture"; its form,
/// yellow or blue, is the face of the key.
class PictureKey : public QPushButton {
  public:
    explicit PictureKey(QWidget* parent = nullptr);
    QSize sizeHint() const override;
    QSize minimumSizeHint() const override;

  protected:
    void paintEvent(QPaintEvent* event) override;
    bool event(QEvent* event) override;
};

}  // namespace zel
