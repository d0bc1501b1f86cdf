#pragma once
// A line whose text changes each second, in a place that does not.

#include <QEvent>
#include <QLabel>
#include <algorithm>

namespace zel {

/// A label of its own size asks nobody for room: the window is laid out again only when a text
/// needs more of it. A window at rest does hardly anything then.
class StillLabel : public QLabel {
  public:
    /// `least` is the width in pixels that it has always, `padding` what the style adds at
    /// most, both sides.
    explicit StillLabel(int least = 0, int lines = 1, int padding = 12)
        : least_(least), lines_(lines), padding_(padding) {}

    void showText(const QString& text) {
        if (text == this->text()) return;
        if (testAttribute(Qt::WA_WState_Polished)) fit(text);
        setText(text);
    }

  protected:
    bool event(QEvent* event) override {
        const bool done = QLabel::event(event);
        if (event->type() == QEvent::Polish) fit(text());
        return done;
    }
    void changeEvent(QEvent* event) override {
        QLabel::changeEvent(event);
        if (event->type() == QEvent::FontChange || event->type() == QEvent::StyleChange)
            fit(text());
    }

  private:
    /// Steps of width keep it where it is while the digits change.
    static constexpr int kStep = 24;

    void fit(const QString& text) {
        const QSize needed = fontMetrics().size(0, text);
        const QMargins around = contentsMargins();
        const int wide = needed.width() + around.left() + around.right() + padding_;
        const int width = wide <= least_ ? least_ : (wide + kStep - 1) / kStep * kStep;
        const int height = lines_ * fontMetrics().lineSpacing() + around.top() + around.bottom();
        const QSize wanted(text.isEmpty() ? least_ : width, std::max(height, needed.height()));
        if (wanted != minimumSize() || wanted != maximumSize()) setFixedSize(wanted);
    }

    int least_;
    int lines_;
    int padding_;
};

}  // namespace zel
