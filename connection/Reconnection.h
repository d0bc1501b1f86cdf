#pragma once
// A line that is lost in a session, a serial port that disappears and returns or a TCP connection
// that ends: offers to connect again with the same profile, or does it by itself, and says which
// settings are other than before.

#include <cstdint>
#include <string>

#include "connection/ConnectionDialog.h"
#include "connection/Disconnection.h"
#include "connection/Doctor.h"
#include "connection/KeptSettings.h"
#include "connection/TcpDialog.h"
#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "link/ZELBas.h"
#include "model/ZEL3Variables.h"
#include "platform/Event.h"
#include "platform/Events.h"
#include "platform/LinkAddress.h"
#include "platform/PortProbe.h"
#include "platform/SerialPort.h"
#include "platform/Services.h"
#include "platform/Socket.h"
#include "trace/Interlock.h"

namespace zel {

class Reconnection {
  public:
    struct Services {
        SerialPort& port;
        PortProbe& probe;
        SettingsStore& settings;
        Doctor& doctor;
        const Socket& socket;
        ZELBas& line;
    };
    struct Dialogs {
        ConnectionDialog& serial;
        TcpDialog& tcp;
    };
    /// Looks at the port once a second; connects the bar's keys and the menu entry, whose tick is
    /// kept between runs.
    Reconnection(Forms& forms, ZEL3Variables& mirror, const Services& services,
                 const Dialogs& dialogs, Disconnection& disconnection, const Interlock& interlock);
    ~Reconnection();
    Reconnection(const Reconnection&) = delete;
    Reconnection& operator=(const Reconnection&) = delete;

  private:
    enum class State : std::uint8_t {
        Quiet,
        Gone,    ///< the port is not there
        Back,    ///< it is there again, or a server can be asked
        Closed,  ///< the session was given up, and the attempt after it failed
    };
    void look();
    bool overTcp() const;
    bool lineIsThere() const;
    void lost();
    bool keepServer();
    void tryServerAgain();
    void connectServer();
    void lookForPort();
    void offer(const std::string& text, bool button);
    void reconnect();
    void report();
    void putAway();
    void setAlways(bool always);

    Forms& forms_;
    ControllerForm& panel_;
    ZEL3Variables& mirror_;
    Services s_;
    Dialogs dialogs_;
    Disconnection& disconnection_;
    const Interlock& interlock_;
    State state_ = State::Quiet;
    std::string port_;  ///< its name, or "HOST:PORT"
    int baud_ = 0;
    LinkAddress server_;  ///< of a session over TCP
    bool tcp_ = false;
    bool paused_ = false;  ///< the user has left an attempt that the option made
    KeptSettings before_;
    bool viewRan_ = false;
    bool recorded_ = false;
    bool busy_ = false;       ///< connects, or asks whether an instrument answers
    std::int64_t askAt_ = 0;  ///< microseconds of the clock
    TaskId view_ = 0;
    Handlers handlers_;
};

}  // namespace zel
