#include "shell/Program.h"

#include <cstdint>
#include <memory>
#include <string>
#include <utility>
#include <vector>

#include "connection/ConnectionDialog.h"
#include "connection/Devices.h"
#include "connection/Dialling.h"
#include "connection/Disconnection.h"
#include "connection/DoctorKeys.h"
#include "connection/Handshake.h"
#include "connection/Profiles.h"
#include "connection/RateSearch.h"
#include "connection/Reconnection.h"
#include "connection/SessionClock.h"
#include "connection/SessionStart.h"
#include "connection/TcpDialog.h"
#include "files/FileMenu.h"
#include "files/FileOps.h"
#include "files/OutputFile.h"
#include "files/RecentFiles.h"
#include "files/Recording.h"
#include "files/ViewHeader.h"
#include "files/ViewReader.h"
#include "files/ViewWriter.h"
#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "forms/MainForm.h"
#include "link/AnswerReader.h"
#include "link/BinaryReader.h"
#include "link/BinaryTrace.h"
#include "link/ByteLink.h"
#include "link/CommandExchange.h"
#include "link/InstrumentLink.h"
#include "model/ZEL3Variables.h"
#include "panel/HardKeys.h"
#include "panel/HelpKeys.h"
#include "panel/KeyRoutines.h"
#include "panel/ManualCommand.h"
#include "panel/MarkerKeys.h"
#include "panel/MarkerReadout.h"
#include "panel/MenuFill.h"
#include "panel/ModeKeys.h"
#include "panel/RemoteToggle.h"
#include "panel/SoftKeys.h"
#include "panel/SoftPanel.h"
#include "panel/SpectrogramKeys.h"
#include "panel/WaterfallKeys.h"
#include "panel/Z9GetCommands.h"
#include "panel/Z9SetCommands.h"
#include "platform/Clock.h"
#include "platform/Files.h"
#include "platform/Form.h"
#include "platform/LinkAddress.h"
#include "platform/Platform.h"
#include "platform/Pointer.h"
#include "platform/Session.h"
#include "platform/TimerDriver.h"
#include "script/Scripts.h"
#include "server/ServerBridge.h"
#include "server/ServerDialog.h"
#include "shell/EndingBoxes.h"
#include "shell/Failures.h"
#include "shell/Guards.h"
#include "shell/Logs.h"
#include "shell/ProgramEnd.h"
#include "shell/SecondTimer.h"
#include "shell/ServerMode.h"
#include "shell/SessionKeys.h"
#include "shell/StartUp.h"
#include "support/AboutBox.h"
#include "support/ErrorReport.h"
#include "support/FileText.h"
#include "support/RoboHelp_CSH.h"
#include "support/VersionInfo.h"
#include "trace/FrequencyLabels.h"
#include "trace/GraphInteraction.h"
#include "trace/GraphScaling.h"
#include "trace/Interlock.h"
#include "trace/ManualScale.h"
#include "trace/PaceMonitor.h"
#include "trace/PowerReadout.h"
#include "trace/Sweep.h"
#include "trace/SweepControl.h"
#include "trace/TraceConversion.h"
#include "trace/TraceReader.h"
#include "trace/UnsureMarks.h"
#include "waterfall/Graph3dOps.h"
#include "waterfall/PictureOptions.h"
#include "waterfall/SweepHistory.h"
#include "waterfall/WaterfallView.h"

namespace zel {

namespace {

std::int16_t connectionKind(LinkAddress::Kind kind) {
    using Kind = LinkAddress::Kind;
    switch (kind) {
        case Kind::TwoModems:
            return ControllerForm::MODEMCON;
        case Kind::TwoPhones:
            return ControllerForm::GSMCON;
        case Kind::ModemToPhone:
            return ControllerForm::MODEMGSMCON;
        case Kind::PhoneToModem:
            return ControllerForm::GSMMODEMCON;
        case Kind::Serial:
            return ControllerForm::DIRECTCON;
        case Kind::Tcp:
        case Kind::Tls:
            break;
    }
    return ControllerForm::TCPCON;
}

}  // namespace

// In the order of the house: a room below stands before those that use it.
struct Program::Rooms {
    Rooms(const Platform& p, SessionLog& sessionLog, std::string commandLine)
        : platform(p),
          record(sessionLog),
          logs(p, commandLine),
          timers(p.events),
          link(forms, line, p.serialPort, p.tcpSocket, session, logs.line()),
          reader(forms, line, link, session),
          exchange(panel, line, link, reader, session),
          bytes(forms, line, link, session),
          binary(panel, line, link, reader, bytes, session),
          instrument{line, link, reader, exchange, binary},
          labels(panel, forms.main, mirror, exchange, p.events),
          marks(panel, mirror),
          conversion(panel, forms.waterfall.Graph3D),
          scaling(panel, forms.waterfall, mirror, p.clock),
          graph(panel, mirror),
          rows(forms.waterfall),
          waterfall(forms, rows, p.folder, p.files),
          pictureOptions(forms.waterfall),
          history(forms),
          manualScale(panel, forms.manualScale, boxes),
          pace(panel, p.clock),
          traces(forms, mirror, instrument, {onGraph, conversion, scaling}, pace, session),
          power(forms, exchange, p.events),
          interlock(forms, line, session),
          sweeps(forms, exchange, traces, power, session),
          files(panel, p.fileDialogs, p.folder, p.files, p.clock),
          views(forms, mirror, onGraph, exchange, files, session),
          viewReader(forms, mirror, {onGraph, conversion, scaling}, files, interlock),
          recording(forms, mirror, instrument, sweeps, views, session),
          recent(panel, p.settings),
          fileMenu(panel, files, p.folder, boxes),
          spectrogram(panel, history, files, boxes),
          waterfallKeys(forms.waterfall, files, boxes),
          softPanel(panel),
          fill(panel, mirror, exchange),
          markerReadout(panel, mirror, exchange),
          keys{softPanel, fill, markerReadout, labels, traces, scaling},
          queries(panel, mirror, exchange, keys, boxes),
          settings(panel, mirror, exchange, keys, queries, session),
          hardKeys(panel, mirror, exchange, MenuRoutines{softPanel, fill}, interlock),
          softKeys(panel, queries, settings, interlock),
          modeKeys(forms, mirror, exchange, MenuRoutines{softPanel, fill}, scaling, interlock),
          markerKeys(panel, mirror, exchange, markerReadout, traces, interlock),
          manualCommand(panel, instrument, interlock),
          helpKeys(forms),
          scripts(forms, {mirror, line, link, reader, exchange, binary},
                  {traces, recording, viewReader, files}, p.folder, interlock),
          help(p.folder, p.files, p.launcher, boxes),
          sessionClock(panel, p.clock),
          profiles(panel, forms.main, p.settings),
          handshake(forms, mirror, instrument, labels, MenuRoutines{softPanel, fill}, session),
          sessionStart(panel, handshake, sessionClock, traces, softPanel),
          dialog(forms, link, sessionStart, profiles, p.serialPorts, session),
          tcpDialog(forms, instrument, sessionStart, p.tcpSocket, p.settings, session),
          disconnection(forms, instrument, p.tcpSocket, sessionClock, graph, interlock),
          dialling(forms, instrument, dialog, sessionStart, disconnection, session),
          devices(forms, p.serialPort, p.serialPorts, {p.folder, p.files}, session),
          remote(panel, exchange, interlock),
          bridge(panel, forms.server, p.serverPort, p.serverSocket, session, logs.rootDebug),
          serverDialog(forms, bridge, p.serverSocket, {p.serialPorts, p.settings, p.clipboard},
                       session, logs.rootDebug),
          serverMode(forms, p.startup, p.events),
          startUp(forms, mirror, softPanel, graph, serverMode, {p.clock, p.settings}),
          second(panel, bridge, sessionClock),
          end(forms, boxes),
          about(forms.about,
                {p.machine, p.files, p.clock, p.clipboard, p.launcher, boxes, p.events},
                p.folder.path() + "/registry.ini"),
          report(forms.error, {p.clipboard, p.fileDialogs, p.files, boxes, p.events}),
          doctor({p.portProbe, p.serialPort, p.tcpSocket, p.clock, p.events}),
          doctorKeys(forms, doctor, p.clipboard, p.events),
          rateSearch(forms, line, doctor, dialog, session),
          reconnection(forms, mirror,
                       {p.serialPort, p.portProbe, p.settings, doctor, p.tcpSocket, line},
                       {dialog, tcpDialog}, disconnection, interlock),
          sessionKeys(panel, record, p.fileDialogs, boxes),
          failures(logs, report, [this] { endAfterFailure(); }) {
        panel.CommandLine = std::move(commandLine);
        history.describe = [this] {
            OutputFile header(files.service(), "", OutputFile::Mode::Output);
            // What the instrument has on automatic is not asked for with each sweep.
            ViewHeader{onGraph.settings, onGraph.instrumentMode, mirror, platform.clock,
                       [](const char*) {}}
                .write(header);
            return header.text();
        };
        handlers.on(p.endSignals.EndRequested,
                    [this](const std::string& name) { endAtOnce(name); });
        // No wait, loop or modal form holds the end up.
        handlers.on(end.Ended, [this] {
            line.Ending = true;
            if (forms.specialMeas.RunsActive > 0) {
                forms.specialMeas.cmdStop.Click();
                forms.specialMeas.ReleaseWait();
            }
            for (Form* form : forms.all())
                if (form->Modal) form->Hide();
        });
        report.sessionLines = [this] { return record.lastLines(); };
        handlers.on(panel.HelpAbout.Clicked, [this] { about.show(); });
        timers.attach(panel.UpNow);
        handlers.on(panel.ShowHelp, [this](int context) { help.showTopic(context); });
        timers.attach(panel.PaceTimer);
        handlers.on(exchange.SettingBegins, [this] { keepSettings(onGraph, mirror); });
        handlers.on(exchange.Answered, [this](const std::string& word, const std::string&) {
            if (word == "REFLVL") onGraph.levelMode = panel.InstrumentMode;
        });
        handlers.on(panel.ResetButton.Clicked,
                    [this] { onGraph.levelMode = panel.InstrumentMode; });
        timers.attach(forms.time.X);
        handlers.on(viewReader.FileLoaded, [this](const std::string& path) { recent.add(path); });
        handlers.on(panel.UtilityTrouble.Clicked, [this] {
            // It is a help on the side: a simulator that is not installed is no error.
            platform.launcher.start(platform.folder.programPath() + "/ZELSim/ZELSim", {"--pty"});
        });
    }

    /// In order, whatever failed: the recording stops, the port is released, the logs are closed.
    void endAfterFailure() {
        panel.MousePointer = kArrow;
        line.Ending = true;
        panel.RecordDataFlag = false;
        try {
            disconnection.endAtOnce();
        } catch (...) {
            // The failure itself is reported already; the port goes with the program.
        }
        record.end();
        end.end();
    }

    /// LOCAL and the close, whatever is under way; then every wait and loop comes to its end.
    void endAtOnce(const std::string& signal) {
        if (end.ended()) return;
        endedBy = signal;
        line.Ending = true;
        disconnection.endAtOnce();
        bridge.disconnect();
        end.end();
    }

    Platform platform;
    SessionLog& record;
    std::string endedBy;  ///< the signal that ended the program
    Forms forms;
    ControllerForm& panel = forms.controller;
    ZELBas line;
    EndingBoxes boxes{platform.boxes, line};
    Session session{platform.clock, platform.events, boxes, panel.DebugTextBox};
    ZEL3Variables mirror;
    Sweep onGraph;
    Logs logs;
    TimerDriver timers;
    ByteLink link;
    AnswerReader reader;
    CommandExchange exchange;
    BinaryReader bytes;
    BinaryTrace binary;
    InstrumentLink instrument;
    FrequencyLabels labels;
    UnsureMarks marks;
    TraceConversion conversion;
    GraphScaling scaling;
    GraphInteraction graph;
    Graph3dOps rows;
    WaterfallView waterfall;
    PictureOptions pictureOptions;
    SweepHistory history;
    ManualScale manualScale;
    PaceMonitor pace;
    TraceReader traces;
    PowerReadout power;
    Interlock interlock;
    SweepControl sweeps;
    FileOps files;
    ViewWriter views;
    ViewReader viewReader;
    Recording recording;
    RecentFiles recent;
    FileMenu fileMenu;
    SpectrogramKeys spectrogram;
    WaterfallKeys waterfallKeys;
    SoftPanel softPanel;
    MenuFill fill;
    MarkerReadout markerReadout;
    KeyRoutines keys;
    Z9GetCommands queries;
    Z9SetCommands settings;
    HardKeys hardKeys;
    SoftKeys softKeys;
    ModeKeys modeKeys;
    MarkerKeys markerKeys;
    ManualCommand manualCommand;
    HelpKeys helpKeys;
    Scripts scripts;
    RoboHelp_CSH help;
    SessionClock sessionClock;
    Profiles profiles;
    Handshake handshake;
    SessionStart sessionStart;
    ConnectionDialog dialog;
    TcpDialog tcpDialog;
    Disconnection disconnection;
    Dialling dialling;
    Devices devices;
    RemoteToggle remote;
    ServerBridge bridge;
    ServerDialog serverDialog;
    ServerMode serverMode;
    StartUp startUp;
    SecondTimer second;
    ProgramEnd end;
    AboutBox about;
    ErrorReport report;
    Doctor doctor;
    DoctorKeys doctorKeys;
    RateSearch rateSearch;
    Reconnection reconnection;
    SessionKeys sessionKeys;
    Failures failures;
    Handlers handlers;
};

Program::Program(const Platform& platform, std::string commandLine)
    : guards_(std::make_unique<Guards>(platform)),
      rooms_(std::make_unique<Rooms>(guards_->platform, guards_->log, std::move(commandLine))) {
    guards_->boxes.quiet = [this] { return rooms_->recording.inTimedTick(); };
    rooms_->end.Ended.connect([this] { Ended(); });
    rooms_->exchange.SettingRefused.connect([this](int status) { SettingRefused(status); });
    rooms_->exchange.Answered.connect(
        [this](const std::string& word, const std::string& value) { Answered(word, value); });
}

Program::~Program() { guards_->boxes.quiet = nullptr; }

void Program::showFailure() {
    rooms_->panel.MousePointer = kArrow;
    rooms_->failures.handle();
}

bool Program::failed() const { return rooms_->failures.failed(); }
std::string Program::crashFile() const { return rooms_->platform.folder.path() + "/crash.log"; }

std::string Program::takeCrash() {
    constexpr std::uint64_t kLongest = 1'000'000;
    FileService& files = rooms_->platform.files;
    const std::string file = crashFile();
    if (!files.stat(file).isRegular()) return {};
    FileProblem problem;
    const std::string trace = readFile(files, file, kLongest, problem).value_or("");
    files.replace(rooms_->platform.folder.path() + "/crash.1.log", trace);
    files.remove(file);
    return trace;
}

bool Program::recordSession(const std::string& path, const std::string& arguments) {
    return rooms_->sessionKeys.begin(path, arguments);
}

SessionLog& Program::sessionLog() { return guards_->log; }
RoboHelp_CSH& Program::help() { return rooms_->help; }
ErrorReport& Program::errorReport() { return rooms_->report; }
Doctor& Program::doctor() { return rooms_->doctor; }
Clipboard& Program::clipboard() { return guards_->platform.clipboard; }
FileService& Program::files() { return guards_->platform.files; }
Clock& Program::clock() { return guards_->platform.clock; }

Forms& Program::forms() { return rooms_->forms; }
ZEL3Variables& Program::variables() { return rooms_->mirror; }
ServerBridge& Program::server() { return rooms_->bridge; }
ServerDialog& Program::serverDialog() { return rooms_->serverDialog; }
ZELBas& Program::link() { return rooms_->line; }
CommandExchange& Program::exchange() { return rooms_->exchange; }
Sweep& Program::sweep() { return rooms_->onGraph; }
TraceReader& Program::traces() { return rooms_->traces; }
SweepHistory& Program::history() { return rooms_->history; }
Logs& Program::logs() { return rooms_->logs; }
Interlock& Program::interlock() { return rooms_->interlock; }
Scripts& Program::scripts() { return rooms_->scripts; }

void Program::start() {
    rooms_->recent.load();
    // Before the first row: loading sets its axes.
    rooms_->forms.waterfall.load();
    if (!rooms_->startUp.Form_Load(kVersion)) rooms_->end.end();
}

bool Program::connect(const LinkAddress& address, bool readTrace) {
    ControllerForm& panel = rooms_->panel;
    if (address.overNetwork()) {
        TCPConnectionForm& dialog = rooms_->forms.tcpConnection;
        panel.ConnectionState = ControllerForm::TCPCON;
        dialog.load();
        dialog.IPAdressTextBox.Text = address.port;
        dialog.RemotePortTextBox.Text = std::to_string(address.number);
        dialog.chkTls.setValue(address.kind == LinkAddress::Kind::Tls);
        dialog.FingerprintTextBox.Text = address.pinned;
        rooms_->tcpDialog.connect(readTrace);
        return panel.isConnected;
    }
    if (!address.dialled()) {
        rooms_->dialog.connectTo(address.port, address.number, readTrace);
        return panel.isConnected;
    }
    const bool quick = panel.immConnectState;
    panel.immConnectState = true;
    rooms_->dialog.SetConnectionKind(connectionKind(address.kind));
    panel.immConnectState = quick;
    MainForm& dialog = rooms_->forms.main;
    dialog.COMList.setText(address.port);
    dialog.BaudList.setText(std::to_string(address.number));
    dialog.TelNumberBox.Text = address.phone;
    rooms_->dialling.dial(readTrace);
    rooms_->softPanel.SetButtonsStatus(ControllerForm::Freq);
    return panel.isConnected;
}

std::string Program::connectionAdvice() const {
    const bool tcp = rooms_->panel.ConnectionState == ControllerForm::TCPCON;
    return tcp ? rooms_->forms.tcpConnection.AdviceLabel.Caption
               : rooms_->forms.main.AdviceLabel.Caption;
}

std::vector<std::string> Program::deviceNames() {
    return rooms_->devices.ReadCommunicationDevices();
}

bool Program::configureDevice(const std::string& name, const std::string& port, int baud) {
    DevicesChoiceForm& form = rooms_->forms.devicesChoice;
    form.load();
    form.AvailableDevicesChoice.setItems(rooms_->devices.ReadCommunicationDevices());
    form.AvailableDevicesChoice.setText(name);
    form.DevicesPortList.setText(port);
    form.DevicesBaudList.setText(std::to_string(baud));
    return rooms_->devices.SetCommunicationDevice();
}

void Program::disconnect() {
    if (rooms_->panel.isConnected) rooms_->disconnection.endSession();
}

bool Program::requestClose() {
    int cancel = 0;
    rooms_->panel.QueryUnload(cancel);
    return cancel == 0;
}

bool Program::ended() const { return rooms_->end.ended(); }
const std::string& Program::endedBy() const { return rooms_->endedBy; }

}  // namespace zel
