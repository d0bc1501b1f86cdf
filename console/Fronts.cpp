#include "console/Fronts.h"

#include <QCoreApplication>

#include "ZELSim/InProcessPort.h"
#include "console/Address.h"
#include "desktop/platform/Language.h"
#include "desktop/platform/QtSystem.h"
#include "platform/virtual/FixedMachine.h"
#include "platform/virtual/MemoryServices.h"
#include "platform/virtual/ScriptedServer.h"
#include "platform/virtual/ScriptedSocket.h"
#include "platform/virtual/VirtualTime.h"

namespace zel {
namespace {

constexpr double kAnswerSeconds = 0.0001;

class SilentDebugChannel : public DebugChannel {
  public:
    void output(const std::string&) override {}
};

class SimulatorFront : public Front {
  public:
    explicit SimulatorFront(const std::string& home) : folder_(QString::fromStdString(home)) {
        ports_.ports = {kSimulatorPort};
        portProbe_.known = {{kSimulatorPort, "", "built-in simulator", ""}};
        portProbe_.rights[kSimulatorPort] = {
            .exists = true, .terminal = true, .usable = true, .group = {}};
        tcpSocket_.connectsTo(SocketState::Error);  // there is no network in here
    }
    const Clock& clock() const override { return clock_; }
    Events& events() override { return events_; }
    QtSignals& endSignals() override { return signals_; }
    Platform platform(Events& served, MessageBoxes& boxes, FileDialogs& dialogs) override {
        return {clock_,        served,    boxes,    port_,      ports_,    tcpSocket_, serverPort_,
                serverSocket_, settings_, debug_,   clipboard_, launcher_, startup_,   folder_,
                dialogs,       files_,    signals_, machine_,   portProbe_};
    }

  private:
    QtSignals signals_;
    VirtualClock clock_;
    VirtualEvents events_{clock_};
    // Virtual time has to go on from one answer to the next also where no sweep is waited for.
    zelsim::InProcessPort port_{clock_, events_, {}, {.answering = kAnswerSeconds}};
    FixedPortList ports_;
    ScriptedSocket tcpSocket_{events_};
    zelsim::InProcessPort serverPort_{clock_, events_, {}, {.answering = kAnswerSeconds}};
    ScriptedServer serverSocket_{events_};
    QtApplicationFolder folder_;
    QtSettingsStore settings_{folder_};
    SilentDebugChannel debug_;
    MemoryClipboard clipboard_;
    MemoryLauncher launcher_;
    MemoryStartupFolder startup_;
    SystemFiles files_;
    SystemMachine machine_;
    FixedProbe portProbe_;
};

class PortFront : public Front {
  public:
    explicit PortFront(const std::string& home) : qt_(QString::fromStdString(home)) {}
    const Clock& clock() const override { return qt_.clock; }
    Events& events() override { return qt_.events; }
    QtSignals& endSignals() override { return qt_.endSignals; }
    Platform platform(Events& served, MessageBoxes& boxes, FileDialogs& dialogs) override {
        return {qt_.clock,       served,        boxes,          qt_.serialPort,
                qt_.serialPorts, qt_.tcpSocket, qt_.serverPort, qt_.serverSocket,
                qt_.settings,    qt_.debug,     clipboard_,     launcher_,
                qt_.startup,     qt_.folder,    dialogs,        qt_.files,
                qt_.endSignals,  qt_.machine,   qt_.portProbe};
    }

  private:
    QtSystem qt_;
    MemoryClipboard clipboard_;  // the system's needs a window
    QtLauncher launcher_;
};

}  // namespace

struct ToolkitSession::Application {
    Application(int& argc, char** argv) : object(argc, argv) {}
    QCoreApplication object;
};

ToolkitSession::ToolkitSession(int& argc, char** argv)
    : application_(std::make_unique<Application>(argc, argv)) {
    QCoreApplication::setApplicationName("ZELRemote");
    useEnglishMessages();
}

ToolkitSession::~ToolkitSession() = default;

std::unique_ptr<Front> makeSimulatorFront(const std::string& home) {
    return std::make_unique<SimulatorFront>(home);
}

std::unique_ptr<Front> makePortFront(const std::string& home) {
    return std::make_unique<PortFront>(home);
}

}  // namespace zel
