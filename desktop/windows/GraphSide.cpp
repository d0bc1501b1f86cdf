#include "desktop/windows/GraphSide.h"

#include <QDateTime>
#include <QEvent>
#include <QFileInfo>
#include <QShortcut>
#include <QVBoxLayout>
#include <memory>
#include <string>
#include <utility>

#include "desktop/binders/Binder.h"
#include "desktop/graph/GraphWidget.h"
#include "desktop/graph/SpectrogramWidget.h"
#include "desktop/windows/ConnectCard.h"
#include "desktop/windows/EmptyScreen.h"
#include "desktop/windows/GraphMenu.h"
#include "desktop/windows/PlaybackBar.h"
#include "desktop/windows/PointerText.h"
#include "desktop/windows/PowerDisplay.h"
#include "desktop/windows/Readouts.h"
#include "desktop/windows/ReconnectBar.h"
#include "model/ZEL3Variables.h"
#include "platform/Form.h"
#include "shell/Program.h"
#include "trace/ViewAnnotations.h"

namespace zel {
namespace {

constexpr int kSpacing = 6;
constexpr const char* kPowerReading = "PWR";

}  // namespace

GraphSide::GraphSide(Program& program, Binder& binder, EmptyScreen::Ways ways, QWidget* parent)
    : QWidget(parent),
      program_(program),
      panel_(program.forms().controller),
      binder_(binder),
      navigator_(program.forms().controller) {
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(kSpacing);
    graph_ = new GraphWidget(panel_.CWGraph1, [this] { return annotations(); });
    connecting_ =
        new ConnectCard(program.forms(), binder, {ways.again, [this] { showEmpty(); }}, graph_);
    empty_ = new EmptyScreen(std::move(ways), graph_);
    connecting_->raise();
    power_ = new PowerDisplay(graph_);
    readouts_ = new Readouts(panel_, binder_);
    graph_->setNavigator(&navigator_);
    pointer_ = std::make_unique<PointerText>(*graph_, *readouts_, panel_);
    graph_->menuAsked = [this](QPoint at, double x) {
        showGraphMenu(at, x, *graph_, navigator_, panel_, binder_, [this] {
            if (copyPicture) copyPicture();
        });
    };
    binder_.bindShow(panel_.CWGraph1, graph_, [this] { refreshGraph(); });
    readings_.on(program_.Answered, [this](const std::string& word, const std::string& value) {
        if (word == kPowerReading && showsPower()) power_->take(value);
    });
    // A setting makes the texts around the trace those of an earlier one.
    panel_.DebugTextBox.Changed.connect([self = QPointer<GraphSide>(this)] {
        if (self && self->program_.sweep().settingsKept)
            self->binder_.refresh(self->panel_.CWGraph1);
    });
    graph_->installEventFilter(this);
    // The wheel looks closer whatever has the focus; so does the way back.
    connect(new QShortcut(QKeySequence("Alt+Left"), this), &QShortcut::activated, this,
            [this] { navigator_.back(); });
    connect(new QShortcut(QKeySequence("Alt+Right"), this), &QShortcut::activated, this,
            [this] { navigator_.forward(); });
    layout->addWidget(new ReconnectBar(panel_, binder_));
    layout->addWidget(graph_, 2);
    layout->addWidget(spectrogram(), 1);
    layout->addWidget(new PlaybackBar(program_.forms(), binder_));
    layout->addWidget(readouts_);
    showEmpty();
}

ViewAnnotations GraphSide::annotations() const {
    return annotateSweep(panel_, program_.variables(), program_.sweep());
}

QWidget* GraphSide::spectrogram() {
    auto* earlier = new SpectrogramWidget(program_.forms(), program_.history(), [this] {
        const QRect plot = graph_->plotArea();
        return std::pair(plot.left(), plot.right() + 1);
    });
    binder_.bindShow(panel_.SpectrogramPicture, earlier, [this, earlier] {
        earlier->setVisible(panel_.SpectrogramPicture.Visible);
        earlier->refresh();
    });
    for (Control* control :
         {static_cast<Control*>(&panel_.SpectrogramPause), static_cast<Control*>(&panel_.CWGraph1)})
        control->Changed.connect([self = QPointer<GraphSide>(this)] {
            if (self && self->panel_.SpectrogramPicture.Visible)
                self->panel_.SpectrogramPicture.noteChange();
        });
    return earlier;
}

void GraphSide::refreshGraph() {
    showSource();
    showChannel();
    graph_->refresh();
    pointer_->show();
    showEmpty();
    showPower();
}

void GraphSide::showSource() {
    QString source;
    if (panel_.Shown.fromFile && !panel_.CWGraph1.values().empty()) {
        source = QString::fromStdString(panel_.RecentFile(0).Caption);
        const QFileInfo file(QString::fromStdString(panel_.RecentFile(0).ToolTip));
        if (file.isFile()) source += file.lastModified().toString("   yyyy-MM-dd hh:mm");
    }
    graph_->setSource(source);
    readouts_->showFile(panel_.Shown.fromFile);
}

void GraphSide::showChannel() {
    const ZEL3Variables& mirror = program_.variables();
    // The stretch of a burst that is measured begins at the trigger.
    if (panel_.isConnected && !panel_.Shown.fromFile && panel_.Shown.xUnit == "s" &&
        panel_.InstrumentMode == ControllerForm::TDMAPOWERMODE)
        return graph_->setChannel(0, mirror.TDMAMeasTime);
    double width = 0;
    if (panel_.isConnected && !panel_.Shown.fromFile) {
        if (panel_.InstrumentMode == ControllerForm::CHANNELPOWER)
            width = mirror.ChannelPowerBandwidth;
        if (panel_.InstrumentMode == ControllerForm::OCCBANDWIDTH)
            width = mirror.OccBWChannelBandwidth;
    }
    const double half = mirror.Span > 0 ? width / 2 : 0;
    graph_->setChannel(mirror.CenterFrequency - half, mirror.CenterFrequency + half);
}

bool GraphSide::showsPower() const {
    return panel_.isConnected && panel_.InstrumentMode == ControllerForm::POWERSENSOR;
}

void GraphSide::showPower() {
    // The edges of the channel belong to the mode, whether the trace changes with it or not.
    if (shownMode_ != panel_.InstrumentMode) {
        shownMode_ = panel_.InstrumentMode;
        showChannel();
        graph_->refresh();
    }
    const bool power = showsPower();
    if (power == power_->isVisibleTo(graph_)) return;
    if (!power) power_->clear();
    power_->setVisible(power);
    showReadouts();
    place();
}

void GraphSide::showReadouts() {
    // Of nothing, or of a trace that is not seen, there is nothing to read.
    const bool there = panel_.isConnected || !panel_.CWGraph1.values().empty();
    readouts_->setVisible(there && !showsPower());
}

void GraphSide::showEmpty() {
    const bool connecting = connecting_->wanted();
    const bool empty = !panel_.isConnected && panel_.CWGraph1.values().empty() && !connecting;
    showReadouts();
    if (empty == empty_->isVisibleTo(graph_) && connecting == connecting_->isVisibleTo(graph_))
        return;
    empty_->setVisible(empty);
    connecting_->setVisible(connecting);
    place();
}

void GraphSide::place() {
    empty_->setGeometry(graph_->rect());
    power_->setGeometry(graph_->rect());
    connecting_->adjustSize();
    connecting_->move((graph_->width() - connecting_->width()) / 2,
                      (graph_->height() - connecting_->height()) / 2);
}

bool GraphSide::eventFilter(QObject* watched, QEvent* event) {
    if (event->type() == QEvent::Resize) place();
    return QWidget::eventFilter(watched, event);
}

}  // namespace zel
