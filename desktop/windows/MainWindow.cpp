#include "desktop/windows/MainWindow.h"

#include <QActionGroup>
#include <QApplication>
#include <QCloseEvent>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QMenuBar>
#include <QStatusBar>
#include <QVBoxLayout>
#include <map>
#include <set>

#include "desktop/graph/GraphImage.h"
#include "desktop/graph/SpectrogramWidget.h"
#include "desktop/windows/FileDrop.h"
#include "desktop/windows/PanelSide.h"
#include "desktop/windows/PlaybackBar.h"
#include "desktop/windows/RemoteWindows.h"
#include "desktop/windows/ScriptEditorWindow.h"
#include "desktop/windows/ScriptFormWindow.h"
#include "desktop/windows/Shortcuts.h"
#include "desktop/windows/WaterfallWindow.h"
#include "trace/Interlock.h"

namespace zel {
namespace {

constexpr int kSpacing = 6;
constexpr int kActivityMs = 150;
constexpr int kDotWidth = 26;
constexpr int kSideWidth = 440;
constexpr int kWidestSide = 620;
constexpr int kPaceWidth = 190;
constexpr int kHourglass = 11;
constexpr const char* kLostDot = "<span style='color:#c0392b'>●</span>";
constexpr QSize kSmallestImage(800, 500);

/// The last part of a text whose parts stand apart goes to a line of its own: the readouts beside
/// it have two lines, and need the room in a small window.
QString inTwoLines(const std::string& parts) {
    QString text = QString::fromStdString(parts);
    if (const qsizetype gap = text.lastIndexOf("   "); gap > 0) text.replace(gap, 3, "\n");
    return text;
}

QLabel* readout() {
    auto* label = new QLabel;
    label->setProperty("readout", true);
    label->setMinimumWidth(60);
    label->setTextFormat(Qt::PlainText);
    return label;
}

}  // namespace

MainWindow::MainWindow(Program& program) : program_(program), panel_(program.forms().controller) {
    setObjectName("ControllerForm");
    setMinimumSize(1000, 570);
    resize(1280, 760);
    Interlock& interlock = program_.interlock();
    binder_.refuses = [&interlock](const Control& control) {
        return interlock.turnOf(control) == Interlock::Turn::Never;
    };
    binder_.defers = [&interlock](const Control& control) {
        return interlock.turnOf(control) == Interlock::Turn::Later;
    };
    binder_.perform = [&interlock](const Control& control, std::function<void()> act) {
        interlock.perform(control, std::move(act));
    };
    auto* centre = new QWidget;
    auto* layout = new QHBoxLayout(centre);
    layout->setSpacing(kSpacing);
    layout->setContentsMargins(kSpacing, kSpacing, kSpacing, kSpacing);
    layout->addWidget(graphSide(), 7);
    auto* side = new PanelSide(panel_, program_.variables(), binder_);
    terminators_ = &side->terminators();
    side->setMinimumWidth(kSideWidth);
    side->setMaximumWidth(kWidestSide);
    layout->addWidget(side, 3);
    setCentralWidget(centre);
    buildMenus();
    buildStatusLine();
    buildShortcuts(*this, panel_, binder_);
    terminators_->buildShortcuts(*this);
    installEventFilter(new FileDrop(
        *this,
        [this, &interlock] { return interlock.turnOf(panel_.LoadData) != Interlock::Turn::Now; },
        [this](const QString& path) { panel_.OpenFile(path.toStdString()); }));

    Forms& forms = program_.forms();
    windows_.push_back(std::make_unique<ConnectionWindow>(forms.main, binder_, this));
    windows_.push_back(std::make_unique<WaterfallWindow>(forms, binder_, this));
    windows_.push_back(std::make_unique<ScriptFormWindow>(forms.specialMeas, binder_, this));
    windows_.push_back(std::make_unique<StatisticsWindow>(forms.std, binder_, this));
    windows_.push_back(std::make_unique<ScriptEditorWindow>(forms.scriptEditor, binder_, this));
    for (Form* form : {static_cast<Form*>(&forms.manualScale),
                       static_cast<Form*>(&forms.powerAndRefl), static_cast<Form*>(&forms.time)})
        windows_.push_back(std::make_unique<PlainFormWindow>(*form, binder_, this));
    windows_.push_back(std::make_unique<TcpWindow>(forms.tcpConnection, binder_, this));
    windows_.push_back(std::make_unique<DevicesWindow>(forms.devicesChoice, binder_, this));
    windows_.push_back(std::make_unique<ServerWindow>(forms.server, binder_, this));
    binder_.bindForm(panel_, this, [this] {
        setWindowTitle(QString::fromStdString(panel_.Caption));
        showState();
    });
    forms.main.Changed.connect([self = QPointer<MainWindow>(this)] {
        if (self) self->binder_.refresh(self->panel_);
    });
    panel_.DrawImage.connect(
        [self = QPointer<MainWindow>(this)](const std::string& path, std::string& problem) {
            if (self) self->drawImage(path, problem);
        });
    binder_.flush();
    graph_->setFocus();
}

MainWindow::~MainWindow() {
    windows_.clear();
    // The widgets outlive the binder, and the focus wanders while they go.
    QObject::disconnect(qApp, nullptr, terminators_, nullptr);
}

void MainWindow::drawImage(const std::string& path, std::string& problem) {
    QString error;
    saveGraphImage(panel_.CWGraph1, annotateView(panel_, program_.variables()),
                   QString::fromStdString(path), &error, graph_->size().expandedTo(kSmallestImage));
    problem = error.toStdString();
}

QWidget* MainWindow::graphSide() {
    auto* side = new QWidget;
    auto* layout = new QVBoxLayout(side);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(kSpacing);
    graph_ = new GraphWidget(panel_.CWGraph1,
                             [this] { return annotateView(panel_, program_.variables()); });
    binder_.bindShow(panel_.CWGraph1, graph_, [this] { graph_->refresh(); });
    layout->addWidget(graph_, 2);
    auto* earlier = new SpectrogramWidget(program_.forms(), program_.history(), [this] {
        const QRect plot = graph_->plotArea();
        return std::pair(plot.left(), plot.right() + 1);
    });
    const auto showEarlier = [this, earlier] {
        earlier->setVisible(panel_.SpectrogramPicture.Visible);
        earlier->refresh();
    };
    binder_.bindShow(panel_.SpectrogramPicture, earlier, showEarlier);
    for (Control* control :
         {static_cast<Control*>(&panel_.SpectrogramPause), static_cast<Control*>(&panel_.CWGraph1)})
        control->Changed.connect([self = QPointer<MainWindow>(this)] {
            if (self && self->panel_.SpectrogramPicture.Visible)
                self->panel_.SpectrogramPicture.noteChange();
        });
    layout->addWidget(earlier, 1);
    layout->addWidget(
        new PlaybackBar(panel_.PlaybackFrame, program_.forms().specialMeas.sldSpeed, binder_));
    auto* readouts = new QGridLayout;
    readouts->setHorizontalSpacing(2 * kSpacing);
    readouts->setVerticalSpacing(2);
    int place = 0;
    for (Label* control :
         {&panel_.CFLabel, &panel_.MarkerLabel, &panel_.SpanLabel, &panel_.DeltaLabel}) {
        QLabel* label = readout();
        binder_.bind(*control, label);
        readouts->addWidget(label, place / 2, place % 2);
        ++place;
    }
    QLabel* pace = new QLabel;
    pace->setObjectName("caption");
    pace->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    pace->setFixedWidth(kPaceWidth);
    binder_.bindShow(panel_.PaceLabel, pace, [this, pace] {
        pace->setText(inTwoLines(panel_.PaceLabel.Caption));
        pace->setVisible(panel_.PaceLabel.Visible);
    });
    readouts->addWidget(pace, 0, 2, 2, 1);
    readouts->setColumnStretch(0, 2);
    readouts->setColumnStretch(1, 3);
    layout->addLayout(readouts);
    auto* line = new PanelLineEdit;
    binder_.bind(panel_.DebugTextBox, line);
    line->setFocusPolicy(Qt::ClickFocus);
    layout->addWidget(line);
    return side;
}

void MainWindow::buildMenus() {
    std::map<const MenuItem*, QMenu*> menus;
    std::set<const MenuItem*> parents;
    for (Control* control : panel_.controls())
        if (control->kind() == ControlKind::MenuItem)
            parents.insert(static_cast<MenuItem*>(control)->parent());
    for (Control* control : panel_.controls()) {
        if (control->kind() != ControlKind::MenuItem) continue;
        auto& item = static_cast<MenuItem&>(*control);
        if (item.parent() == nullptr || parents.count(&item) > 0) {
            QMenu* menu = item.parent() == nullptr ? menuBar()->addMenu(QString())
                                                   : menus[item.parent()]->addMenu(QString());
            menu->setToolTipsVisible(&item == &panel_.RecentMenu);  // the paths
            menus[&item] = menu;
            binder_.bind(item, menu->menuAction());
        } else if (item.Caption.get() == "-") {
            menus[item.parent()]->addSeparator();
        } else {
            binder_.bind(item, menus[item.parent()]->addAction(QString()));
        }
    }
}

void MainWindow::addThemeMenu(ThemeChoice now, const std::function<void(ThemeChoice)>& choose) {
    auto* menu = qobject_cast<QAction*>(binder_.widgetOf(panel_.ViewMenu))->menu();
    menu->addSeparator();
    auto* group = new QActionGroup(menu);
    constexpr std::pair<ThemeChoice, const char*> kThemes[] = {
        {ThemeChoice::System, "Theme of the System"},
        {ThemeChoice::Light, "Light Theme"},
        {ThemeChoice::Dark, "Dark Theme"},
    };
    for (const auto& [theme, caption] : kThemes) {
        QAction* action = menu->addAction(caption);
        action->setCheckable(true);
        action->setChecked(theme == now);
        group->addAction(action);
        connect(action, &QAction::triggered, this, [this, choose, chosen = theme] {
            choose(chosen);
            binder_.refreshAll();
        });
    }
}

void MainWindow::buildStatusLine() {
    state_ = new QLabel;
    activity_ = new QLabel;
    activity_->setToolTip("Traffic on the link");
    activity_->setText("<span style='color:#77818b'>●</span>");
    activity_->setMinimumWidth(kDotWidth);
    busy_ = new QProgressBar;
    busy_->setRange(0, 0);
    busy_->setFixedSize(90, 10);
    busy_->setTextVisible(false);
    auto* clock = new QLabel;
    statusBar()->addWidget(activity_);
    statusBar()->addWidget(state_, 1);
    auto* progress = new QLabel;
    auto* wait = new QLabel;
    statusBar()->addPermanentWidget(wait);
    statusBar()->addPermanentWidget(progress);
    statusBar()->addPermanentWidget(busy_);
    statusBar()->addPermanentWidget(clock);
    statusBar()->setSizeGripEnabled(false);
    binder_.bind(panel_.TimeLabel, clock);
    binder_.bind(panel_.FileLabel, progress);
    binder_.bind(panel_.WaitLabel, wait);
    for (Picture* picture : {&panel_.ConnectedPic, &panel_.Picture3})
        binder_.bindShow(*picture, state_, [this] { showState(); });
    activityOff_.setSingleShot(true);
    connect(&activityOff_, &QTimer::timeout, this,
            [this] { activity_->setText("<span style='color:#77818b'>●</span>"); });
    activityOff_.start(0);
    panel_.DebugTextBox.Changed.connect([self = QPointer<MainWindow>(this)] {
        if (!self || self->activityOff_.isActive() || self->panel_.LinkLost) return;
        self->activity_->setText("<span style='color:#27ae60'>●</span>");
        self->activityOff_.start(kActivityMs);
    });
}

void MainWindow::showState() {
    const Forms& forms = program_.forms();
    QString text = "Not connected";
    if (panel_.isConnected) {
        const bool tcp = panel_.ConnectionState == ControllerForm::TCPCON;
        const QString id = QString::fromStdString(tcp ? forms.tcpConnection.IDTextBox.Text
                                                      : forms.main.IDText.Text);
        const QString where =
            tcp ? QString::fromStdString(forms.tcpConnection.IPAdressTextBox.Text.get() + ":" +
                                         forms.tcpConnection.RemotePortTextBox.Text.get())
                : QString::fromStdString(forms.main.COMList.Text() + ", " +
                                         forms.main.BaudList.Text() + " baud");
        text = (panel_.LinkLost ? "Connection lost: " : "Connected: ") + id + "  (" + where + ")";
    } else if (forms.main.IsConnecting && forms.main.MousePointer == kHourglass) {
        text = "Connecting...";
    }
    state_->setText(text);
    if (panel_.LinkLost) {
        activityOff_.stop();
        activity_->setText(kLostDot);
    } else if (activity_->text() == kLostDot) {
        activityOff_.start(0);
    }
    const bool busy = panel_.MousePointer == kHourglass || forms.main.MousePointer == kHourglass;
    busy_->setVisible(busy && !panel_.ContinuosLoopActive);
    setCursor(busy && !panel_.ContinuosLoopActive ? Qt::BusyCursor : Qt::ArrowCursor);
}

void MainWindow::keyPressEvent(QKeyEvent* event) {
    if (!terminators_->typeAhead(*event)) QMainWindow::keyPressEvent(event);
}

void MainWindow::showNow() {
    binder_.flush();
    graph_->drawNow();
}

void MainWindow::closeEvent(QCloseEvent* event) {
    if (program_.ended() || program_.requestClose()) {
        event->accept();
    } else {
        event->ignore();
    }
}

}  // namespace zel
