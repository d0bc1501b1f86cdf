#include "desktop/windows/PlaybackBar.h"

#include <QHBoxLayout>

namespace zel {
namespace {

QLabel* word(const QString& text) {
    auto* label = new QLabel(text);
    label->setObjectName("caption");
    return label;
}

}  // namespace

PlaybackBar::PlaybackBar(Frame& frame, Slider& speed, Binder& binder, QWidget* parent)
    : QWidget(parent) {
    auto* layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    auto* slider = new QSlider(Qt::Horizontal);
    slider->setPageStep(2);
    slider->setMinimumWidth(160);
    slider->setMaximumWidth(360);
    layout->addWidget(word("Speed:"));
    layout->addWidget(word("slow"));
    layout->addWidget(slider, 1);
    layout->addWidget(word("fast"));
    layout->addStretch(1);
    binder.bind(speed, slider);
    binder.bind(frame, this, nullptr);
    setVisible(frame.Visible);
}

}  // namespace zel
