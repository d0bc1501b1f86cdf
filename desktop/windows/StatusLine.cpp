#include "desktop/windows/StatusLine.h"

#include <QHBoxLayout>
#include <QPointer>
#include <QStatusBar>

#include "desktop/binders/Binder.h"
#include "desktop/binders/OwnTexts.h"
#include "desktop/platform/SimulatorChild.h"
#include "desktop/windows/StillLabel.h"
#include "forms/Forms.h"
#include "model/ZEL3Variables.h"
#include "platform/Controls.h"
#include "platform/Pointer.h"
#include "support/NumberText.h"

namespace zel {
namespace {

constexpr int kActivityMs = 150;
constexpr int kSaidMs = 12000;
constexpr int kWaitStepMs = 250;
constexpr int kNoticeMs = 1000;   // a wait is written when it has lasted that long
constexpr double kLongSweep = 2;  // seconds
constexpr const char* kDot = "<span style='color:%1'>●</span>";
constexpr const char* kQuiet = "#77818b";
constexpr const char* kThere = "#27ae60";
constexpr const char* kLost = "#e0483a";

}  // namespace

QString shortIdentity(const QString& identity) {
    const QStringList parts = identity.split(',');
    if (parts.size() < 3) return identity.trimmed();
    return parts[1].trimmed() + " #" + parts[2].trimmed();
}

StatusLine::StatusLine(QMainWindow& window, Forms& forms, const ZEL3Variables& mirror,
                       Binder& binder)
    : QObject(&window),
      window_(window),
      forms_(forms),
      panel_(forms.controller),
      mirror_(mirror),
      state_(new QLabel),
      activity_(new QLabel),
      busy_(new QProgressBar),
      sweep_(new QProgressBar),
      wait_(new QLabel) {
    QStatusBar* bar = window.statusBar();
    bar->setSizeGripEnabled(false);
    auto* line = new PanelLineEdit;
    line->setFrame(false);
    line->setProperty("flat", true);
    binder.bind(panel_.DebugTextBox, line);
    line->setFocusPolicy(Qt::ClickFocus);
    // A message hides the place; the line itself is shown again with each of its texts.
    auto* place = new QWidget;
    auto* layout = new QHBoxLayout(place);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(line);
    bar->addWidget(place, 1);
    busy_->setRange(0, 0);
    busy_->setFixedSize(90, 8);
    busy_->setTextVisible(false);
    busy_->setAccessibleName(QObject::tr("Work is under way"));
    auto* progress = new QLabel;
    sweep_->setFixedSize(150, 16);
    sweep_->setAccessibleName(QObject::tr("Sweep"));
    sweep_->hide();
    for (QWidget* widget : {static_cast<QWidget*>(wait_), static_cast<QWidget*>(progress),
                            static_cast<QWidget*>(sweep_), static_cast<QWidget*>(busy_)})
        bar->addPermanentWidget(widget);
    binder.bind(panel_.FileLabel, progress);
    connect(&waitTimer_, &QTimer::timeout, this, [this] {
        waitedMs_ += kWaitStepMs;
        showWait();
    });
    binder.bindShow(panel_.WaitLabel, wait_, [this] { showWait(); });

    activity_->setTextFormat(Qt::RichText);
    activity_->setToolTip(QObject::tr("Traffic on the link"));
    activity_->setAccessibleName(QObject::tr("Traffic on the link"));
    state_->setTextFormat(Qt::PlainText);
    state_->setAccessibleName(QObject::tr("State of the connection"));
    auto* clock = new StillLabel;
    clock->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    for (QLabel* label : {activity_, state_, static_cast<QLabel*>(clock)})
        bar->addPermanentWidget(label);
    binder.bindShow(panel_.TimeLabel, clock, [this, clock] {
        clock->showText(QString::fromStdString(panel_.TimeLabel.Caption));
        // It runs on after an attempt that has failed, which is the time of no session.
        const bool failed = !panel_.isConnected && panel_.UpNow.Enabled && panel_.StartT != 0 &&
                            !forms_.main.Attempting && !forms_.main.Searching &&
                            !forms_.tcpConnection.Connecting;
        clock->setVisible(panel_.TimeLabel.Visible && !failed);
    });
    for (Picture* picture : {&panel_.ConnectedPic, &panel_.Picture3})
        binder.bindShow(*picture, state_, [this] { showState(); });
    // An attempt by TCP begins and ends with the words of its step.
    forms_.tcpConnection.AdviceLabel.Changed.connect([self = QPointer<StatusLine>(this)] {
        if (self) self->showState();
    });
    activityOff_.setSingleShot(true);
    connect(&activityOff_, &QTimer::timeout, this, [this] { showActivity(false); });
    panel_.DebugTextBox.Changed.connect([self = QPointer<StatusLine>(this)] {
        if (!self || self->activityOff_.isActive() || self->panel_.LinkLost) return;
        self->showActivity(true);
        self->activityOff_.start(kActivityMs);
    });
    showState();
}

void StatusLine::showActivity(bool active) {
    const char* color = kQuiet;
    if (panel_.LinkLost) color = kLost;
    if (!panel_.LinkLost && (active || panel_.isConnected)) color = active ? "#5fe08d" : kThere;
    activity_->setText(QString(kDot).arg(color));
}

QString StatusLine::stateText() const {
    if (!panel_.isConnected) {
        const bool connecting = forms_.main.Attempting || forms_.tcpConnection.Connecting;
        return connecting ? QObject::tr("Connecting...") : QObject::tr("Not connected");
    }
    const bool tcp = panel_.ConnectionState == ControllerForm::TCPCON;
    const QString id =
        QString::fromStdString(tcp ? forms_.tcpConnection.IDTextBox.Text : forms_.main.IDText.Text);
    const QString where =
        tcp ? QString::fromStdString(forms_.tcpConnection.IPAdressTextBox.Text.get() + ":" +
                                     forms_.tcpConnection.RemotePortTextBox.Text.get())
            : QString::fromStdString(forms_.main.COMList.Text() + ", " +
                                     forms_.main.BaudList.Text() + " baud");
    state_->setToolTip(id + "\n" + where);
    const bool simulated = where.contains(SimulatorChild::kLinkName);
    return (panel_.LinkLost ? QObject::tr("Connection lost:") + " " : QString()) +
           shortIdentity(id) + QString::fromUtf8(" · ") +
           (simulated ? QObject::tr("simulated instrument") : where.section('/', -1));
}

void StatusLine::showState() {
    if (!panel_.isConnected) state_->setToolTip({});
    state_->setText(stateText());
    if (panel_.LinkLost) activityOff_.stop();
    showActivity(activityOff_.isActive());
    // A view and a playback show by themselves that they are at work.
    const bool shown = busy() && !panel_.ContinuosLoopActive && !panel_.SeriesPlays;
    busy_->setVisible(shown);
    window_.setCursor(shown ? Qt::BusyCursor : Qt::ArrowCursor);
}

void StatusLine::showWait() {
    const QString text = ownText(panel_.WaitLabel.Caption);
    const bool reads =
        panel_.isConnected && (panel_.ContinuosLoopActive || panel_.AcquisitionRunning);
    const bool sweeps = !text.isEmpty() && reads && mirror_.SweepTime >= kLongSweep;
    if (!sweeps) {
        waitTimer_.stop();
    } else if (!waitTimer_.isActive()) {
        waitedMs_ = kNoticeMs;
        waitTimer_.start(kWaitStepMs);
    }
    const double length = mirror_.SweepTime * kNoticeMs;
    const bool within = sweeps && waitedMs_ <= length;
    if (within) {
        sweep_->setRange(0, static_cast<int>(length));
        sweep_->setValue(waitedMs_);
        sweep_->setFormat(QObject::tr("Sweep: %1 of %2 s")
                              .arg(waitedMs_ / kNoticeMs)
                              .arg(QString::fromStdString(shortestNumber(mirror_.SweepTime))));
    }
    sweep_->setVisible(within);
    wait_->setText(text);
    wait_->setVisible(!within);
}

bool StatusLine::busy() const {
    return panel_.MousePointer == kHourglass || forms_.main.MousePointer == kHourglass;
}

void StatusLine::say(const QString& text) { window_.statusBar()->showMessage(text, kSaidMs); }

}  // namespace zel
