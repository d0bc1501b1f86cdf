#include "desktop/windows/PlaybackBar.h"

#include <QGridLayout>
#include <QHBoxLayout>
#include <QPointer>

#include "desktop/binders/Binder.h"
#include "desktop/windows/ThemeIcons.h"
#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "platform/Controls.h"

namespace zel {
namespace {

constexpr int kIconSize = 16;
constexpr int kSpacing = 4;
constexpr int kPageOfTraces = 10;
constexpr int kSpeedWidth = 120;
constexpr double kMsPerSecond = 1000;

QLabel* word(const QString& text) {
    auto* label = new QLabel(text);
    label->setObjectName("caption");
    return label;
}

QPushButton* key(Button& control, const char* icon, Binder& binder) {
    auto* button = new QPushButton;
    button->setProperty("tool", true);
    button->setIcon(themeIcon(icon));
    button->setIconSize({kIconSize, kIconSize});
    binder.bind(control, button);
    return button;
}

QCheckBox* box(CheckBox& control, Binder& binder) {
    auto* widget = new QCheckBox;
    binder.bind(control, widget);
    return widget;
}

}  // namespace

PlaybackBar::PlaybackBar(Forms& forms, Binder& binder, QWidget* parent)
    : QWidget(parent), script_(forms.specialMeas), pace_(word({})) {
    ControllerForm& panel = forms.controller;
    auto* rows = new QVBoxLayout(this);
    rows->setContentsMargins(0, 0, 0, 0);
    rows->setSpacing(kSpacing);

    auto* first = new QHBoxLayout;
    first->setSpacing(kSpacing);
    first->addWidget(key(panel.PlaybackBack, "back", binder));
    QPushButton* play = key(panel.PlaybackPlay, "play", binder);
    // Both words have room, so that nothing moves.
    constexpr int kPlayWidth = 84;
    play->setMinimumWidth(kPlayWidth);
    first->addWidget(play);
    first->addWidget(key(panel.PlaybackForward, "forward", binder));
    auto* position = new QSlider(Qt::Horizontal);
    position->setPageStep(kPageOfTraces);
    binder.bind(panel.PlaybackPosition, position);
    first->addWidget(position, 1);
    auto* label = new QLabel;
    label->setProperty("readout", true);
    binder.bind(panel.PlaybackLabel, label);
    first->addWidget(label);
    rows->addLayout(first);

    auto* second = new QHBoxLayout;
    second->setSpacing(kSpacing * 2);
    auto* slider = new QSlider(Qt::Horizontal);
    slider->setPageStep(2);
    slider->setFixedWidth(kSpeedWidth);
    second->addWidget(word(QObject::tr("Speed:")));
    second->addWidget(slider);
    second->addWidget(pace_);
    second->addWidget(box(panel.PlaybackRealTime, binder));
    second->addWidget(box(panel.PlaybackRepeat, binder));
    second->addStretch(1);
    second->addWidget(key(panel.PlaybackClose, "close", binder));
    rows->addLayout(second);

    binder.bind(script_.sldSpeed, slider);
    binder.bind(panel.PlaybackFrame, this, nullptr);
    const QPointer<PlaybackBar> self(this);
    panel.PlaybackPlay.Changed.connect([play, self, &panel, shown = std::string()]() mutable {
        if (!self || shown == panel.PlaybackPlay.Caption.get()) return;
        shown = panel.PlaybackPlay.Caption;
        play->setIcon(themeIcon(panel.SeriesPlays ? "pause" : "play"));
    });
    script_.sldSpeed.Changed.connect([self] {
        if (self) self->showPace();
    });
    showPace();
    setVisible(panel.PlaybackFrame.Visible);
}

void PlaybackBar::showEvent(QShowEvent* event) {
    // Not before: the start of the window would wait for the fonts.
    pace_->setMinimumWidth(
        pace_->fontMetrics().horizontalAdvance(QObject::tr("%1 traces/s").arg("10.0")) + kSpacing);
    QWidget::showEvent(event);
}

void PlaybackBar::showPace() {
    const int ms = script_.seriesPauseMs();
    pace_->setText(
        ms == 0 ? QObject::tr("all at once")
                : QObject::tr("%1 traces/s").arg(QString::number(kMsPerSecond / ms, 'f', 1)));
}

}  // namespace zel
