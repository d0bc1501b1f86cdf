#include "desktop/windows/MainWindow.h"

#include <QActionGroup>
#include <QApplication>
#include <QCloseEvent>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QMenuBar>
#include <QShortcut>
#include <QStatusBar>
#include <QVBoxLayout>
#include <map>

#include "desktop/windows/PanelSide.h"

namespace zel {
namespace {

constexpr int kSpacing = 6;
constexpr int kActivityMs = 150;
constexpr int kDotWidth = 26;
constexpr int kSideWidth = 440;
constexpr int kWidestSide = 620;
constexpr int kHourglass = 11;

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
    binder_.refuses = [this](const Control& control) { return mustNotDisturb(control); };
    auto* centre = new QWidget;
    auto* layout = new QHBoxLayout(centre);
    layout->setSpacing(kSpacing);
    layout->setContentsMargins(kSpacing, kSpacing, kSpacing, kSpacing);
    layout->addWidget(graphSide(), 7);
    auto* side = new PanelSide(panel_, binder_);
    side->setMinimumWidth(kSideWidth);
    side->setMaximumWidth(kWidestSide);
    layout->addWidget(side, 3);
    setCentralWidget(centre);
    buildMenus();
    buildStatusLine();
    buildShortcuts();

    Forms& forms = program_.forms();
    windows_.push_back(std::make_unique<ConnectionWindow>(forms.main, binder_, this));
    for (Form* form :
         {static_cast<Form*>(&forms.manualScale), static_cast<Form*>(&forms.powerAndRefl),
          static_cast<Form*>(&forms.tcpConnection), static_cast<Form*>(&forms.server)})
        windows_.push_back(std::make_unique<PlainFormWindow>(*form, binder_, this));
    binder_.bindForm(panel_, this, [this] {
        setWindowTitle(QString::fromStdString(panel_.Caption));
        showState();
    });
    forms.main.Changed.connect([self = QPointer<MainWindow>(this)] {
        if (self) self->binder_.refresh(self->panel_);
    });
    binder_.flush();
    graph_->setFocus();
}

MainWindow::~MainWindow() { windows_.clear(); }

bool MainWindow::mustNotDisturb(const Control& control) const {
    // The continuous view refuses by itself, in words.
    if (panel_.ContinuosLoopActive) return false;
    const bool busy = panel_.MousePointer == kHourglass || panel_.AcquisitionRunning ||
                      program_.forms().main.MousePointer == kHourglass;
    const bool always = &control == &panel_.StopButton || &control == &panel_.ExitObject ||
                        &control == &program_.forms().main.CancelButton;
    return busy && !always;
}

QWidget* MainWindow::graphSide() {
    auto* side = new QWidget;
    auto* layout = new QVBoxLayout(side);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(kSpacing);
    graph_ = new GraphWidget(panel_.CWGraph1,
                             [this] { return annotateView(panel_, program_.variables()); });
    binder_.bindShow(panel_.CWGraph1, graph_, [this] { graph_->refresh(); });
    layout->addWidget(graph_, 1);
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
    binder_.bind(panel_.PaceLabel, pace);
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
    for (Control* control : panel_.controls()) {
        if (control->kind() != ControlKind::MenuItem) continue;
        auto& item = static_cast<MenuItem&>(*control);
        if (item.parent() == nullptr) {
            QMenu* menu = menuBar()->addMenu(QString());
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
    auto* menu = new QMenu("View", this);
    auto* help = qobject_cast<QAction*>(binder_.widgetOf(panel_.HelpMenu));
    menuBar()->insertMenu(help, menu);
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
    statusBar()->addPermanentWidget(busy_);
    statusBar()->addPermanentWidget(clock);
    statusBar()->setSizeGripEnabled(false);
    binder_.bind(panel_.TimeLabel, clock);
    for (Picture* picture : {&panel_.ConnectedPic, &panel_.Picture3})
        binder_.bindShow(*picture, state_, [this] { showState(); });
    activityOff_.setSingleShot(true);
    connect(&activityOff_, &QTimer::timeout, this,
            [this] { activity_->setText("<span style='color:#77818b'>●</span>"); });
    activityOff_.start(0);
    panel_.DebugTextBox.Changed.connect([self = QPointer<MainWindow>(this)] {
        if (!self || self->activityOff_.isActive()) return;
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
        text = "Connected: " + id + "  (" + where + ")";
    } else if (forms.main.IsConnecting && forms.main.MousePointer == kHourglass) {
        text = "Connecting...";
    }
    state_->setText(text);
    const bool busy = panel_.MousePointer == kHourglass || forms.main.MousePointer == kHourglass;
    busy_->setVisible(busy && !panel_.ContinuosLoopActive);
    setCursor(busy && !panel_.ContinuosLoopActive ? Qt::BusyCursor : Qt::ArrowCursor);
}

void MainWindow::shortcut(const QKeySequence& keys, Button& control) {
    auto* action = new QShortcut(keys, this);
    connect(action, &QShortcut::activated, this, [this, &control] {
        const auto* widget = qobject_cast<QPushButton*>(binder_.widgetOf(control));
        if (widget != nullptr && widget->isVisible() && widget->isEnabled() &&
            !mustNotDisturb(control))
            control.Click();
    });
}

void MainWindow::buildShortcuts() {
    for (int i = 0; i < panel_.SoftKey.count(); ++i)
        shortcut(QKeySequence(Qt::Key_F2 + i), panel_.SoftKey(i));
    shortcut(QKeySequence(Qt::Key_F9), panel_.PlaySingleButton);
    shortcut(QKeySequence(Qt::Key_F10), panel_.PlayContinuousButton);
    shortcut(QKeySequence(Qt::Key_Escape), panel_.StopButton);
    const std::pair<Qt::Key, Button*> hardKeys[] = {
        {Qt::Key_F, &panel_.FrequencyButton}, {Qt::Key_S, &panel_.SpanButton},
        {Qt::Key_A, &panel_.AmplitudeButton}, {Qt::Key_B, &panel_.BWButton},
        {Qt::Key_W, &panel_.SweepButton},     {Qt::Key_T, &panel_.TraceButton},
        {Qt::Key_M, &panel_.MeasButton},      {Qt::Key_G, &panel_.TrackButton1},
        {Qt::Key_K, &panel_.MarkerButton},    {Qt::Key_Z, &panel_.cmdZoom},
        {Qt::Key_P, &panel_.MarkPkButton},    {Qt::Key_N, &panel_.NextPeakButton},
    };
    for (const auto& [key, control] : hardKeys) shortcut(QKeySequence(Qt::CTRL | key), *control);
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
