#include "console/Fronts.h"

#include <QCoreApplication>
#include <memory>
#include <optional>
#include <string>

#include "ZELSim/InProcessPort.h"
#include "console/Address.h"
#include "console/VirtualFront.h"
#include "desktop/platform/Language.h"
#include "desktop/platform/QtSystem.h"
#include "platform/Clock.h"
#include "platform/Events.h"
#include "platform/MessageBox.h"
#include "platform/Platform.h"
#include "platform/Services.h"
#include "platform/Socket.h"
#include "platform/virtual/FixedMachine.h"
#include "platform/virtual/MemoryServices.h"
#include "platform/virtual/ScriptedSocket.h"

namespace zel {
namespace {

constexpr double kAnswerSeconds = 0.0001;

class SimulatorFront : public VirtualFront {
  public:
    explicit SimulatorFront(const std::string& home) : VirtualFront(home) {
        portProbe_.known = {{kSimulatorPort, "", "built-in simulator", ""}};
        portProbe_.rights[kSimulatorPort] = {
            .exists = true, .terminal = true, .usable = true, .group = {}};
        tcpSocket_.connectsTo(SocketState::Error);  // there is no network in here
    }

  private:
    Lines lines() override { return {port_, tcpSocket_, serverPort_, portProbe_}; }

    // Virtual time has to go on from one answer to the next also where no sweep is waited for.
    zelsim::InProcessPort port_{clock_, events_, {}, {.answering = kAnswerSeconds}};
    ScriptedSocket tcpSocket_{events_};
    zelsim::InProcessPort serverPort_{clock_, events_, {}, {.answering = kAnswerSeconds}};
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
    /// The plain event loop wakes sooner than the one of windows, which nothing here needs.
    Application(int& argc, char** argv) {
        constexpr const char* kPlainLoop = "QT_NO_GLIB";
        const bool chosen = qEnvironmentVariableIsSet(kPlainLoop);
        if (!chosen) qputenv(kPlainLoop, "1");
        object.emplace(argc, argv);
        if (!chosen) qunsetenv(kPlainLoop);  // programs that are started have their own
    }
    std::optional<QCoreApplication> object;
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
