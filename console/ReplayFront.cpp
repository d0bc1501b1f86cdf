#include "console/ReplayFront.h"

#include "ZELSim/ReplayPort.h"
#include "console/Address.h"
#include "desktop/platform/QtSystem.h"
#include "platform/virtual/MemoryServices.h"
#include "platform/virtual/ScriptedPort.h"
#include "platform/virtual/ScriptedServer.h"
#include "platform/virtual/VirtualTime.h"

namespace zel {
namespace {

class SilentDebugChannel : public DebugChannel {
  public:
    void output(const std::string&) override {}
};

class ReplayFront : public Front {
  public:
    ReplayFront(const SessionRecord& record, const std::string& home)
        : source_(record, clock_, events_,
                  [this](std::int64_t micros) { clock_.advanceMicros(micros - clock_.micros()); }),
          folder_(QString::fromStdString(home)) {
        ports_.ports = {kSimulatorPort};
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
    zelsim::ReplaySource source_;
    zelsim::ReplayPort port_{source_};
    zelsim::ReplaySocket tcpSocket_{source_};
    FixedPortList ports_;
    ScriptedPort serverPort_{events_};
    ScriptedServer serverSocket_{events_};
    QtApplicationFolder folder_;
    QtSettingsStore settings_{folder_};
    SilentDebugChannel debug_;
    MemoryClipboard clipboard_;
    MemoryLauncher launcher_;
    MemoryStartupFolder startup_;
    SystemFiles files_;
    SystemMachine machine_;
    SystemPortProbe portProbe_;
};

}  // namespace

std::unique_ptr<Front> makeReplayFront(const SessionRecord& record, const std::string& home) {
    return std::make_unique<ReplayFront>(record, home);
}

}  // namespace zel
