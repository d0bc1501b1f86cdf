#include "desktop/windows/MainWindow.h"

#include <QActionGroup>
#include <QApplication>
#include <QClipboard>
#include <QCloseEvent>
#include <QCoreApplication>
#include <QFileInfo>
#include <QHBoxLayout>
#include <QMessageBox>
#include <QPushButton>
#include <QTimer>
#include <QToolButton>
#include <algorithm>
#include <cstddef>
#include <functional>
#include <memory>
#include <string>
#include <utility>

#include "desktop/graph/GraphImage.h"
#include "desktop/platform/Language.h"
#include "desktop/platform/SimulatorChild.h"
#include "desktop/windows/EntryMarks.h"
#include "desktop/windows/FileDrop.h"
#include "desktop/windows/FormWindow.h"
#include "desktop/windows/GraphSide.h"
#include "desktop/windows/MainMenus.h"
#include "desktop/windows/PanelSide.h"
#include "desktop/windows/RecentConnections.h"
#include "desktop/windows/RemoteWindows.h"
#include "desktop/windows/ScriptEditorWindow.h"
#include "desktop/windows/ScriptFormWindow.h"
#include "desktop/windows/Shortcuts.h"
#include "desktop/windows/StatusLine.h"
#include "desktop/windows/SupportWindows.h"
#include "desktop/windows/Theme.h"
#include "desktop/windows/ThemeIcons.h"
#include "desktop/windows/ToolStrip.h"
#include "desktop/windows/TraceToolsDock.h"
#include "desktop/windows/WaterfallWindow.h"
#include "desktop/windows/WindowMemory.h"
#include "model/CodeTables.h"
#include "platform/Controls.h"
#include "platform/Event.h"
#include "platform/Form.h"
#include "platform/LinkAddress.h"
#include "platform/Services.h"
#include "shell/Program.h"
#include "support/SessionLog.h"
#include "trace/Interlock.h"
#include "trace/ViewAnnotations.h"

namespace zel {
namespace {

constexpr int kSpacing = 6;
constexpr int kInstrumentBaud = 57600;
constexpr QSize kSmallestImage(800, 500);
constexpr int kIconMs = 100;

QString modeText(int mode) {
    const CodeRow* row = findCode(CodeTable::MeasurementMode, mode);
    return row == nullptr ? QString() : QString::fromUtf8(row->text.data());
}

}  // namespace

MainWindow::MainWindow(Program& program) : program_(program), panel_(program.forms().controller) {
    setObjectName("ControllerForm");
    // The icon is not part of the first picture.
    QTimer::singleShot(kIconMs, this, [this] { setWindowIcon(applicationIcon()); });
    setMinimumSize(1000, 570);
    resize(1280, 760);
    Interlock& interlock = program_.interlock();
    binder_.refuses = [&interlock](const Control& control) {
        return interlock.turnOf(control) == Interlock::Turn::Never;
    };
    binder_.defers = [&interlock](const Control& control) {
        return interlock.turnOf(control) == Interlock::Turn::Later;
    };
    binder_.failed = [this] { program_.showFailure(); };
    binder_.perform = [&interlock](const Control& control, std::function<void()> act) {
        interlock.perform(control, std::move(act));
    };
    binder_.reasonAgainst = [this, &interlock](const Control& control) {
        const std::string reason = interlock.reasonAgainst(control);
        if (!reason.empty()) return reason;
        // A recording that plays keeps everything else away.
        if (panel_.SeriesPlays && interlock.turnOf(control) == Interlock::Turn::Never)
            return QObject::tr("Stop the playback first").toStdString();
        return reasonHere(control);
    };
    buildMainMenus(*this, panel_, binder_);
    buildCentre();
    status_ = new StatusLine(*this, program_.forms(), program_.variables(), binder_);
    tools_ = new ToolStrip(program_.forms(), binder_,
                           {[this] { copyPicture(); }, [this] { graph().wholeView(); }}, this);
    addToolBar(tools_);
    buildShortcuts(*this, panel_, binder_);
    terminators_->buildShortcuts(*this);
    buildViewKeys();
    installEventFilter(new FileDrop(
        *this,
        [this, &interlock] { return interlock.turnOf(panel_.LoadData) != Interlock::Turn::Now; },
        [this](const QString& path) { openFile(path); }));
    buildWindows();
    addTraceTools(*this, program_, graph(), *menuOf(panel_.Utility, binder_));
    followState();
    binder_.flush();
    graph().setFocus();
}

MainWindow::~MainWindow() {
    windows_.clear();
    // The widgets outlive the binder, and the focus wanders while they go.
    QObject::disconnect(qApp, nullptr, terminators_, nullptr);
}

void MainWindow::buildCentre() {
    const auto clickWritten = [this](MenuItem& item) {
        program_.sessionLog().clicked(item.name());
        item.Click();
    };
    auto* centre = new QWidget;
    auto* layout = new QHBoxLayout(centre);
    layout->setSpacing(kSpacing);
    layout->setContentsMargins(kSpacing, kSpacing, kSpacing, kSpacing);
    graphSide_ =
        new GraphSide(program_, binder_,
                      {[this, clickWritten] { clickWritten(panel_.Direct); },
                       [this](int place) {
                           if (!recent_) return;
                           connectTo(recent_->addresses().at(static_cast<std::size_t>(place)));
                       },
                       [this] {
                           connectToSimulator_ = true;
                           panel_.UtilityTrouble.Click();
                       },
                       [this, clickWritten] { clickWritten(panel_.LoadData); },
                       [this] {
                           if (LinkAddress last; addressOf(program_.forms(), last)) connectTo(last);
                       }});
    graphSide_->copyPicture = [this] { copyPicture(); };
    layout->addWidget(graphSide_, 1);
    side_ = new PanelSide(panel_, program_.variables(), binder_);
    terminators_ = &side_->terminators();
    new EntryMarks(program_, binder_, side_->refusals(), this);
    layout->addWidget(side_);
    setCentralWidget(centre);
}

/// In the record as a choice in the dialog of the menu: another machine has no such entry.
void MainWindow::tellOpened(const std::string& path) {
    program_.sessionLog().clicked(panel_.LoadData.name());
    program_.sessionLog().input("answer " + path);
}

void MainWindow::openFile(const QString& file) {
    const std::string path = QFileInfo(file).absoluteFilePath().toStdString();
    tellOpened(path);
    panel_.OpenFile(path);
}

void MainWindow::buildWindows() {
    binder_.tell = [this](const std::string& act, const std::string& what) {
        SessionLog& record = program_.sessionLog();
        if (act != "click") return record.input(act + " " + what);
        for (const MenuItem& file : panel_.RecentFile)
            if (file.name() == what) return tellOpened(file.ToolTip);
        record.clicked(what);
    };
    graph().told = [this](const std::string& line) { program_.sessionLog().input(line); };
    Forms& forms = program_.forms();
    offer<ConnectionWindow>(forms.main);
    offer<WaterfallWindow>(forms.waterfall, forms);
    offer<ScriptFormWindow>(forms.specialMeas);
    offer<StatisticsWindow>(forms.std);
    offer<ScriptEditorWindow>(forms.scriptEditor);
    for (Form* form : {static_cast<Form*>(&forms.manualScale),
                       static_cast<Form*>(&forms.powerAndRefl), static_cast<Form*>(&forms.time)})
        offer<PlainFormWindow>(*form);
    offer<TcpWindow>(forms.tcpConnection);
    offer<AboutWindow>(forms.about);
    offer<ErrorWindow>(forms.error);
    offer<DoctorWindow>(forms.doctor);
    offer<DevicesWindow>(forms.devicesChoice);
    offer<ServerWindow>(forms.server);
}

template <class Window, class Shown>
void MainWindow::offer(Form& form, Shown& shown) {
    const auto make = [this, &shown] {
        windows_.push_back(std::make_unique<Window>(shown, binder_, this));
    };
    offers_.push_back(std::make_unique<Offer>(Offer{form, make}));
    // Most sessions see few of them, and none before the panel.
    form.Changed.connect([self = QPointer<MainWindow>(this), offer = offers_.back().get()] {
        if (self && offer->form.Visible) self->build(*offer);
    });
    if (form.Visible) this->build(*offers_.back());
}

template <class Window, class Shown>
void MainWindow::offer(Shown& form) {
    offer<Window>(form, form);
}

void MainWindow::build(Offer& offer) {
    if (std::exchange(offer.built, true)) return;
    offer.build();
}

void MainWindow::buildAll() {
    for (const auto& offer : offers_) build(*offer);
}

void MainWindow::buildViewKeys() {
    QMenu* view = menuOf(panel_.ViewMenu, binder_);
    view->addSeparator();
    QAction* keys = view->addAction(QObject::tr("Panel"));
    keys->setCheckable(true);
    keys->setChecked(true);
    keys->setShortcut(QKeySequence("F12"));
    connect(keys, &QAction::toggled, this, [this](bool shown) { side_->setVisible(shown); });
    QAction* whole = view->addAction(QObject::tr("Full Screen"));
    whole->setCheckable(true);
    whole->setShortcut(QKeySequence("F11"));
    whole->setObjectName("FullScreen");
    connect(whole, &QAction::triggered, this, [this](bool full) {
        setWindowState(full ? windowState() | Qt::WindowFullScreen
                            : windowState() & ~Qt::WindowFullScreen);
    });
    QMenu* file = menuOf(panel_.FileMenu, binder_);
    auto* image = qobject_cast<QAction*>(binder_.widgetOf(panel_.RecordData));
    auto* copy = new QAction(QObject::tr("Copy Picture"), this);
    copy->setObjectName("CopyPicture");
    copy->setShortcut(QKeySequence::Copy);
    connect(copy, &QAction::triggered, this, [this] { copyPicture(); });
    file->insertAction(image, copy);
}

void MainWindow::followState() {
    Forms& forms = program_.forms();
    binder_.bindForm(panel_, this, [this] { showState(); });
    for (Event<>* changed :
         {&forms.main.Changed, &panel_.StopButton.Changed, &panel_.ConnectedPic.Changed,
          &panel_.PlayContinuousButton.Changed, &panel_.CWGraph1.Changed})
        changed->connect([self = QPointer<MainWindow>(this)] {
            if (self) self->binder_.refresh(self->panel_);
        });
    panel_.DrawImage.connect(
        [self = QPointer<MainWindow>(this)](const std::string& path, std::string& problem) {
            if (self) self->drawImage(path, problem);
        });
}

QString MainWindow::titleText() const {
    const QString program = QString::fromStdString(panel_.Caption);
    QString shown;
    const ViewAnnotations view = annotateView(panel_, program_.variables());
    if (view.ok && panel_.Shown.fromFile) {
        shown = QString::fromStdString(panel_.RecentFile(0).Caption);
    } else if (panel_.isConnected) {
        const bool tcp = panel_.ConnectionState == ControllerForm::TCPCON;
        const Forms& forms = program_.forms();
        shown = shortIdentity(QString::fromStdString(tcp ? forms.tcpConnection.IDTextBox.Text
                                                         : forms.main.IDText.Text)) +
                ", " + modeText(panel_.InstrumentMode);
    }
    return shown.isEmpty() ? program : shown + QString::fromUtf8(" – ") + program;
}

void MainWindow::showState() {
    if (const QString title = titleText(); title != windowTitle()) setWindowTitle(title);
    status_->showState();
    tools_->showConnected(panel_.isConnected);
    tools_->showTrace(!panel_.CWGraph1.values().empty());
    graphSide_->showEmpty();
    graphSide_->showPower();
    greyWhatRefuses();
    LinkAddress address;
    if (recent_ && panel_.isConnected && !panel_.LinkLost && addressOf(program_.forms(), address) &&
        address.port.find(SimulatorChild::kLinkName) == std::string::npos)
        recent_->add(address);
}

std::string MainWindow::reasonHere(const Control& control) const {
    const Control* const needLine[] = {&panel_.PlaySingleButton,  &panel_.PlayContinuousButton,
                                       &panel_.ResetButton,       &panel_.AnalyzerButton,
                                       &panel_.AnalyzerCheck,     &panel_.TrackButton,
                                       &panel_.TrackingGenCheck,  &panel_.PwrButton,
                                       &panel_.PowerSensorCheck,  &panel_.ChnPwrButton,
                                       &panel_.ChannelPowerCheck, &panel_.OccBWButton,
                                       &panel_.OccBWCheck,        &panel_.TDMAButton,
                                       &panel_.TDMAPowerCheck,    &panel_.DistFaultButton,
                                       &panel_.DistFaultCheck,    &panel_.MarkerCheckBox,
                                       &panel_.DeltaCheckBox};
    const bool instrument =
        std::find(std::begin(needLine), std::end(needLine), &control) != std::end(needLine);
    if (instrument && !panel_.isConnected)
        return QObject::tr("Connect to an instrument first").toStdString();
    const bool looks = &control == &panel_.cmdZoom || &control == &panel_.MenuFileSaveImage;
    if (looks && panel_.CWGraph1.values().empty())
        return QObject::tr("There is no trace yet").toStdString();
    return {};
}

void MainWindow::greyWhatRefuses() {
    const bool view = panel_.ContinuosLoopActive ||
                      (panel_.AcquisitionRunning && panel_.STOPFlag && !panel_.RecordDataFlag);
    const int state = (panel_.isConnected ? 1 : 0) + (view ? 2 : 0) +
                      (panel_.InstrumentMode == ControllerForm::POWERSENSOR ? 4 : 0) +
                      (panel_.RecordDataFlag ? 8 : 0) +
                      (panel_.CWGraph1.values().empty() ? 0 : 16) + (panel_.SeriesPlays ? 32 : 0);
    side_->showState(view, panel_.isConnected && panel_.Shown.fromFile);
    if (state == lockState_) return;
    lockState_ = state;
    for (const Control* control : panel_.controls()) binder_.refresh(*control);
}

void MainWindow::connectTo(const LinkAddress& address) {
    const Forms& forms = program_.forms();
    if (panel_.isConnected || forms.main.Attempting || forms.main.Searching ||
        forms.tcpConnection.Connecting)
        return;
    program_.sessionLog().input("connect");
    program_.connect(address, true);
}

void MainWindow::useSettings(SettingsStore& settings) {
    memory_ = std::make_unique<WindowMemory>(settings);
    recent_ = std::make_unique<RecentConnections>(settings);
    memory_->restore(*this, *side_);
    graphSide_->empty().setRecent(recent_->names());
    connect(side_, &PanelSide::folded, this, [this] { memory_->keepFolded(*side_); });
}

void MainWindow::simulatorReady(const QString& device) {
    status_->say(QObject::tr("The simulated instrument runs at %1").arg(device));
    const bool atOnce = connectToSimulator_;
    connectToSimulator_ = false;
    if (panel_.isConnected) return;
    if (!atOnce) {
        const auto answer = QMessageBox::question(
            this, windowTitle(), QObject::tr("The simulated instrument runs. Connect to it now?"));
        if (answer != QMessageBox::Yes) return;
    }
    connectTo({LinkAddress::Kind::Serial, device.toStdString(), kInstrumentBaud, {}, {}});
}

void MainWindow::simulatorEnded(const QString& why) {
    connectToSimulator_ = false;
    status_->say(why);
}

void MainWindow::addThemeMenu(ThemeChoice now, const std::function<void(ThemeChoice)>& choose) {
    QMenu* menu = menuOf(panel_.ViewMenu, binder_);
    menu->addSeparator();
    auto* group = new QActionGroup(menu);
    constexpr std::pair<ThemeChoice, const char*> kThemes[] = {
        {ThemeChoice::System, QT_TRANSLATE_NOOP("QObject", "Theme of the System")},
        {ThemeChoice::Light, QT_TRANSLATE_NOOP("QObject", "Light Theme")},
        {ThemeChoice::Dark, QT_TRANSLATE_NOOP("QObject", "Dark Theme")},
    };
    for (const auto& [theme, caption] : kThemes) {
        QAction* action = menu->addAction(QObject::tr(caption));
        action->setCheckable(true);
        action->setChecked(theme == now);
        group->addAction(action);
        connect(action, &QAction::triggered, this, [this, choose, chosen = theme] {
            choose(chosen);
            binder_.refreshAll();
        });
    }
}

void MainWindow::addLanguageMenu(const QString& now,
                                 const std::function<void(const QString&)>& choose) {
    QMenu* menu = menuOf(panel_.ViewMenu, binder_)->addMenu(QObject::tr("Language"));
    auto* group = new QActionGroup(menu);
    for (const UiLanguage& language : languages()) {
        const QString code = language.code;
        // A language bears its own name, whatever the texts around it.
        QAction* action = menu->addAction(code.isEmpty() ? QObject::tr("Language of the System")
                                                         : QString::fromUtf8(language.name));
        action->setCheckable(true);
        action->setChecked(code == now);
        group->addAction(action);
        connect(action, &QAction::triggered, this, [this, choose, code] {
            choose(code);
            status_->say(QObject::tr("The language changes with the next start"));
        });
    }
}

void MainWindow::drawImage(const std::string& path, std::string& problem) {
    QString error;
    graph().drawNow();
    saveGraphImage(panel_.CWGraph1, graphSide_->annotations(), QString::fromStdString(path), &error,
                   graph().size().expandedTo(kSmallestImage), true,
                   findChild<TraceToolsDock*>()->picture());
    problem = error.toStdString();
}

void MainWindow::copyPicture() {
    if (panel_.CWGraph1.values().empty())
        return status_->say(QObject::tr("There is no trace to copy yet"));
    graph().drawNow();
    QApplication::clipboard()->setPixmap(graph().grab());
    status_->say(QObject::tr("A picture of the graph is in the clipboard"));
}

void MainWindow::keyPressEvent(QKeyEvent* event) {
    // Enter presses the button that has the focus, here as in the dialogs.
    const bool enters = event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter;
    auto* focused = qobject_cast<QAbstractButton*>(focusWidget());
    const bool pressed = qobject_cast<QPushButton*>(focused) != nullptr ||
                         qobject_cast<QToolButton*>(focused) != nullptr;
    if (enters && pressed && focused->isEnabled() && !event->isAutoRepeat())
        return focused->click();
    if (!terminators_->typeAhead(*event)) QMainWindow::keyPressEvent(event);
}

void MainWindow::changeEvent(QEvent* event) {
    QMainWindow::changeEvent(event);
    if (event->type() != QEvent::WindowStateChange) return;
    if (auto* action = findChild<QAction*>("FullScreen"); action != nullptr)
        action->setChecked(isFullScreen());
}

void MainWindow::showNow() {
    binder_.flush();
    graph().drawNow();
}

/// All parts know their fonts, and so their sizes, from here on. Laid out now and not by the posted
/// events after this one, the window is painted once at the start.
void MainWindow::showEvent(QShowEvent* event) {
    QMainWindow::showEvent(event);
    QCoreApplication::sendPostedEvents(nullptr, QEvent::LayoutRequest);
    side_->settle();
}

void MainWindow::closeEvent(QCloseEvent* event) {
    if (memory_) memory_->keep(*this);
    if (program_.ended() || program_.requestClose()) {
        event->accept();
    } else {
        event->ignore();
    }
}

}  // namespace zel
