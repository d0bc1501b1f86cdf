#pragma once
// What the platforms in virtual time have in common; the instrument's end of the lines differs.

#include <string>

#include "console/Address.h"
#include "console/Fronts.h"
#include "desktop/platform/QtSystem.h"
#include "desktop/platform/SystemFiles.h"
#include "desktop/platform/SystemMachine.h"
#include "platform/Clock.h"
#include "platform/Events.h"
#include "platform/MessageBox.h"
#include "platform/Platform.h"
#include "platform/PortProbe.h"
#include "platform/SerialPort.h"
#include "platform/Services.h"
#include "platform/Socket.h"
#include "platform/virtual/MemoryServices.h"
#include "platform/virtual/ScriptedServer.h"
#include "platform/virtual/VirtualTime.h"

namespace zel {

class VirtualFront : public Front {
  public:
    const Clock& clock() const override { return clock_; }
    Events& events() override { return events_; }
    QtSignals& endSignals() override { return signals_; }
    Platform platform(Events& served, MessageBoxes& boxes, FileDialogs& dialogs) override {
        const Lines ends = lines();
        return {clock_,        served,    boxes,    ends.port,  ports_,    ends.socket, ends.server,
                serverSocket_, settings_, debug_,   clipboard_, launcher_, startup_,    folder_,
                dialogs,       files_,    signals_, machine_,   ends.probe};
    }

  protected:
    /// What the instrument is reached by, and what the doctor finds there.
    struct Lines {
        SerialPort& port;
        Socket& socket;
        SerialPort& server;
        PortProbe& probe;
    };

    explicit VirtualFront(const std::string& home) : folder_(QString::fromStdString(home)) {
        ports_.ports = {kSimulatorPort};
    }
    virtual Lines lines() = 0;

    VirtualClock clock_;
    VirtualEvents events_{clock_};

  private:
    class SilentDebugChannel : public DebugChannel {
      public:
        void output(const std::string&) override {}
    };

    QtSignals signals_;
    FixedPortList ports_;
    ScriptedServer serverSocket_{events_};
    QtApplicationFolder folder_;
    SystemFiles files_;
    QtSettingsStore settings_{folder_, files_};
    SilentDebugChannel debug_;
    MemoryClipboard clipboard_;
    MemoryLauncher launcher_;
    MemoryStartupFolder startup_;
    SystemMachine machine_;
};

}  // namespace zel
