#include "desktop/windows/TraceToolsDock.h"

#include <QMainWindow>
#include <QMenu>
#include <QMenuBar>
#include <QScrollArea>
#include <algorithm>
#include <cmath>
#include <cstddef>
#include <optional>
#include <utility>

#include "analysis/Correction.h"
#include "analysis/Hold.h"
#include "analysis/HostMarkers.h"
#include "analysis/HostTraces.h"
#include "analysis/Mask.h"
#include "analysis/TraceAnalysis.h"
#include "analysis/TraceTools.h"
#include "desktop/binders/Binder.h"
#include "desktop/binders/OwnTexts.h"
#include "desktop/graph/GraphWidget.h"
#include "desktop/graph/TraceOverlay.h"
#include "desktop/windows/FaultPage.h"
#include "desktop/windows/LimitsPage.h"
#include "desktop/windows/PeaksPage.h"
#include "desktop/windows/PowerPage.h"
#include "desktop/windows/StatisticsPage.h"
#include "desktop/windows/TracePage.h"
#include "desktop/windows/TracesPage.h"
#include "desktop/windows/WatchPage.h"
#include "model/CodeTables.h"
#include "model/Numeric.h"
#include "model/ZEL3Variables.h"
#include "shell/Program.h"
#include "support/NumberText.h"
#include "trace/Sweep.h"

namespace zel {
namespace {

constexpr QSize kUsualSize(460, 430);
constexpr int kTopic = 2112;        // of the help book
constexpr double kHeadroom = 0.05;  // of the levels' extent, above and below

}  // namespace

TraceToolsDock::TraceToolsDock(Program& program, GraphWidget& graph, QMainWindow& window)
    : QDockWidget(QObject::tr("Trace Tools"), &window),
      program_(program),
      panel_(program.forms().controller),
      graph_(graph),
      watch_(program.files(), command_, program.clock()),
      overlay_(graph) {
    setObjectName("TraceTools");
    turn_.setSingleShot(true);
    connect(&turn_, &QTimer::timeout, this, [this] { showNow(); });
    setProperty("topic", kTopic);
    follow();
    letMarkersMove();
}

TraceToolsDock::~TraceToolsDock() = default;

void TraceToolsDock::build() {
    if (pages_ != nullptr) return;
    pages_ = new QTabWidget;
    markers_ = new MarkersPage(tools_);
    traces_ = new TracesPage(tools_, [this] { scaleLevelAxis(); });
    limits_ = new LimitsPage(tools_);
    const std::pair<const char*, TracePage*> pages[] = {
        {QT_TRANSLATE_NOOP("QObject", "Traces"), traces_},
        {QT_TRANSLATE_NOOP("QObject", "Peaks"),
         new PeaksPage(tools_, [this](std::size_t peak) { markers_->follow(peak); })},
        {QT_TRANSLATE_NOOP("QObject", "Markers"), markers_},
        {QT_TRANSLATE_NOOP("QObject", "Power"), new PowerPage(tools_)},
        {QT_TRANSLATE_NOOP("QObject", "Limits"), limits_},
        {QT_TRANSLATE_NOOP("QObject", "Watch"), new WatchPage(tools_, watch_)},
        {QT_TRANSLATE_NOOP("QObject", "Statistics"), new StatisticsPage(tools_)},
        {QT_TRANSLATE_NOOP("QObject", "Fault"), new FaultPage(tools_)}};
    for (const auto& [name, page] : pages) pages_->addTab(page, QObject::tr(name));
    connect(pages_, &QTabWidget::currentChanged, this, [this] { showLater(); });
    setWidget(pages_);
}

void TraceToolsDock::setVisible(bool visible) {
    if (visible && !placed_) {
        placed_ = true;
        build();
        setFloating(true);
        resize(kUsualSize);
        // Beside the middle of the window that it belongs to, as a dialog.
        if (parentWidget() != nullptr)
            move(parentWidget()->frameGeometry().center() - rect().center());
    }
    QDockWidget::setVisible(visible);
}

void TraceToolsDock::follow() {
    const QPointer<TraceToolsDock> self(this);
    panel_.CWGraph1.Changed.connect([self] {
        if (self) self->takeSweep(false);
    });
    panel_.TraceLoaded.connect([self] {
        if (self) self->takeSweep(true);
    });
    tools_.Changed.connect([this] { showLater(); });
}

void TraceToolsDock::takeSweep(bool loaded) {
    const Graph& graph = panel_.CWGraph1;
    if (!loaded) {
        // The axes or a note may have changed alone; a file's trace is there when it is loaded.
        if (graph.plotSerial() == plotSerial_ || panel_.Shown.fromFile) return showLater();
        plotSerial_ = graph.plotSerial();
        // An earlier sweep that is shown once more was counted when it came.
        if (graph.values() != program_.sweep().shown || program_.sweep().time == lastTime_)
            return showLater();
        lastTime_ = program_.sweep().time;
    }
    plotSerial_ = graph.plotSerial();
    SweepSource source;
    source.mode = panel_.InstrumentMode;
    if (panel_.Shown.fromFile) source.rbw = leadingNumber(panel_.Shown.rbw);
    tools_.take(program_.sweep(), source);
    // What was saved once is not watched again.
    if (!loaded) watch_.take(program_.sweep(), tools_.verdict());
}

void TraceToolsDock::showLater() {
    // With the window's own frame: quick sweeps are not drawn one by one.
    if (!turn_.isActive()) turn_.start(kFrameMs);
}

void TraceToolsDock::showNow() {
    turn_.stop();
    const OverlayPicture now = picture();
    if (!now.empty() || drawn_) {
        overlay_.show(now);
        graph_.replot(QCustomPlot::rpQueuedReplot);
    }
    drawn_ = !now.empty();
    if (isVisible() && pages_ != nullptr)
        if (auto* page = dynamic_cast<TracePage*>(pages_->currentWidget())) page->showState();
}

void TraceToolsDock::showEvent(QShowEvent* event) {
    QDockWidget::showEvent(event);
    showLater();
}

double TraceToolsDock::graphX(double x) const {
    // At zero span the graph spreads the sweep over two intervals less.
    const auto& trace = tools_.trace();
    const double step = trace ? trace->step() : 0;
    if (step <= 0) return x;
    const Graph& graph = panel_.CWGraph1;
    const double pairs = program_.sweep().autoPeak() ? 2 : 1;
    return graph.firstX() + (x - trace->x.front()) / step * pairs * graph.increment();
}

double TraceToolsDock::traceX(double graphX) const {
    const auto& trace = tools_.trace();
    const double step = trace ? trace->step() : 0;
    const Graph& graph = panel_.CWGraph1;
    const double width = graph.increment() * (program_.sweep().autoPeak() ? 2 : 1);
    if (step <= 0 || width == 0) return graphX;
    return std::clamp(trace->x.front() + (graphX - graph.firstX()) / width * step, trace->x.front(),
                      trace->x.back());
}

void TraceToolsDock::letMarkersMove() {
    graph_.hostMarkerAt = [this](const QPointF& pixel) {
        constexpr double kReach = 8;  // pixels
        int nearest = 0;
        double distance = kReach;
        for (const OverlayMarker& marker : picture().markers) {
            const double away = std::hypot(graph_.xAxis->coordToPixel(marker.x) - pixel.x(),
                                           graph_.yAxis->coordToPixel(marker.y) - pixel.y());
            if (away > distance) continue;
            distance = away;
            nearest = marker.number;
        }
        return nearest;
    };
    graph_.hostMarkerMoved = [this](int number, double x) {
        HostMarker& marker = tools_.markers.at(static_cast<std::size_t>(number) - 1);
        marker.peak = 0;
        marker.x = traceX(x);
        tools_.refresh();
    };
}

std::optional<double> TraceToolsDock::graphY(double level) const {
    const ZEL3Variables& settings = program_.sweep().settings;
    const auto& trace = tools_.trace();
    const bool field = trace && trace->unit == "dBuV/m" && settings.ReferenceUnit != UNITDBUVM;
    if (settings.ReferenceRange < RANGELIN) return level;
    if (field) return std::nullopt;  // percent of a level at the input
    if (settings.ReferenceUnit == UNITV)
        return DbmToPercent(level, VoltsToDbm(settings.ReferenceLevel));
    if (settings.ReferenceUnit == UNITW)
        return LinearToPercent(DbToLinear(level - 30), settings.ReferenceLevel);
    return DbmToPercent(level, settings.ReferenceLevel);
}

void TraceToolsDock::addCurve(OverlayPicture& picture, const SpectrumTrace& trace,
                              const QColor& color) const {
    OverlayCurve curve;
    curve.color = color;
    for (std::size_t i = 0; i < trace.level.size(); ++i) {
        const auto y = graphY(trace.level[i]);
        if (!y) return;
        curve.x << graphX(trace.x[i]);
        curve.y << *y;
    }
    picture.curves.push_back(std::move(curve));
}

OverlayPicture TraceToolsDock::picture() const {
    OverlayPicture picture;
    auto* self = const_cast<TraceToolsDock*>(this);
    TraceTools& tools = self->tools_;
    const std::optional<SpectrumTrace>& now = tools.trace();
    QStringList foot;
    if (!tools.problem().empty() && (tools.request.mask || !tools.corrections().empty()))
        foot << QObject::tr("No figures: %1").arg(QString::fromStdString(tools.problem()));
    if (now) {
        for (std::size_t i = 0; i < kHolds; ++i)
            if (tools.traces().isOn(static_cast<HoldKind>(i)))
                addCurve(picture, tools.traces().held(static_cast<HoldKind>(i)),
                         self->traces().color(i));
        for (std::size_t i = 0; i < kMemories; ++i) {
            const auto& memory = tools.traces().memory(i);
            if (!memory || !self->traces().memoryShown(i)) continue;
            if (closeAxes(*memory, *now)) {
                addCurve(picture, *memory, self->traces().color(kHolds + i));
            } else {
                foot << QObject::tr("Reference %1 has another span or unit").arg(i + 1);
            }
        }
        if (const auto less = self->traces_ == nullptr ? std::nullopt : traces_->normalisedBy()) {
            if (const auto trace = tools.traces().normalised(*now, *less)) {
                addCurve(picture, *trace, self->traces().color(kHolds + kMemories));
                foot << QObject::tr("Sweep less reference %1, dB").arg(*less + 1);
            }
        }
        if (!tools.corrections().empty())
            addCurve(picture, *now, self->traces().color(kHolds + kMemories));
        for (std::size_t i = 0; i < kHostMarkers; ++i) {
            if (!tools.markers.at(i).on) continue;
            const MarkerReading& reading = tools.readings().at(i);
            if (!reading.x || !reading.level) continue;
            if (const auto y = graphY(*reading.level))
                picture.markers.push_back({graphX(*reading.x), *y, static_cast<int>(i) + 1});
        }
    }
    if (const auto& mask = tools.request.mask) {
        for (const LimitLine* line : {&mask->upper, &mask->lower}) {
            OverlayCurve curve;
            curve.color = limitColor();
            curve.dashed = true;
            for (std::size_t i = 0; i < line->x.size(); ++i) {
                const auto y = graphY(line->level[i]);
                if (!y) break;
                curve.x << graphX(line->x[i]);
                curve.y << *y;
            }
            if (!curve.x.isEmpty()) picture.curves.push_back(std::move(curve));
        }
        const AnalysisResult& result = tools.result();
        if (result.mask) {
            picture.failed = !result.mask->pass;
            QString verdict = QObject::tr("Mask: %1")
                                  .arg(picture.failed ? QObject::tr("FAIL") : QObject::tr("pass"));
            verdict += result.mask->margin ? QObject::tr(", margin %1 at %2")
                                                 .arg(levelText(result.mask->margin, "dB"),
                                                      placeText(result.mask->x, tools.trace()))
                                           : QObject::tr(", no sample covered");
            if (tools.maskCount().sweeps > 0) verdict += "; " + ownText(tools.maskCount().text());
            foot << verdict;
        }
    }
    if (const std::string names = correctionNames(tools.corrections()); !names.empty())
        foot << QObject::tr("Corrected: %1").arg(QString::fromStdString(names)) +
                    (now ? ", " + QString::fromStdString(now->unit) : QString());
    picture.foot = foot.join('\n');
    picture.notice = ownText(tools.traces().ended());
    return picture;
}

void TraceToolsDock::scaleLevelAxis() {
    double low = 0;
    double high = 0;
    bool any = false;
    const auto add = [&](double y) {
        if (!std::isfinite(y)) return;
        low = any ? std::min(low, y) : y;
        high = any ? std::max(high, y) : y;
        any = true;
    };
    for (const double value : panel_.CWGraph1.values()) add(value);
    for (const OverlayCurve& curve : picture().curves)
        for (const double value : curve.y) add(value);
    if (!any) return;
    const double room = std::max(1.0, (high - low) * kHeadroom);
    graph_.showLevels(std::floor(low - room), std::ceil(high + room));
}

void TraceToolsDock::fill(QMenu& menu) {
    QAction* shown = toggleViewAction();
    shown->setText(QObject::tr("Trace Tools"));
    menu.addAction(shown);
    menu.addSeparator();
    for (std::size_t i = 0; i < kHolds; ++i) {
        const auto kind = static_cast<HoldKind>(i);
        QAction* action = menu.addAction(QObject::tr(TracesPage::kNames.at(i)));
        action->setCheckable(true);
        connect(action, &QAction::triggered, this, [this, kind](bool on) {
            tools_.traces().switchOn(kind, on);
            tools_.refresh();
        });
        connect(&menu, &QMenu::aboutToShow, action,
                [this, action, kind] { action->setChecked(tools_.traces().isOn(kind)); });
    }
    menu.addAction(QObject::tr("Clear Held Traces"), this, [this] {
        for (std::size_t i = 0; i < kHolds; ++i) tools_.traces().clear(static_cast<HoldKind>(i));
        tools_.traces().acknowledge();
        tools_.refresh();
    });
    menu.addSeparator();
    menu.addAction(QObject::tr("Scale Level Axis"), this, [this] { scaleLevelAxis(); });
}

TraceToolsDock* addTraceTools(QMainWindow& window, Program& program, GraphWidget& graph,
                              QMenu& before) {
    auto* dock = new TraceToolsDock(program, graph, window);
    window.addDockWidget(Qt::BottomDockWidgetArea, dock);
    dock->hide();
    auto* menu = new QMenu(QObject::tr("&Trace"), &window);
    window.menuBar()->insertMenu(before.menuAction(), menu);
    dock->fill(*menu);
    return dock;
}

}  // namespace zel
