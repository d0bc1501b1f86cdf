#pragma once
// The composition root: owns the forms, the mirror and the rooms, and wires them together.

#include <memory>
#include <string>
#include <vector>

#include "forms/Forms.h"
#include "link/ZELBas.h"
#include "model/ZEL3Variables.h"
#include "platform/Clock.h"
#include "platform/Event.h"
#include "platform/Files.h"
#include "platform/LinkAddress.h"
#include "platform/Platform.h"

namespace zel {

struct Guards;

class Clipboard;
class CommandExchange;
class Doctor;
class ErrorReport;
class Interlock;
class Logs;
class RoboHelp_CSH;
class ServerBridge;
class ServerDialog;
class SessionLog;
class SweepHistory;
class TraceReader;
struct Scripts;
struct Sweep;

class Program {
  public:
    /// `commandLine` holds the words that the program was started with.
    Program(const Platform& platform, std::string commandLine);
    ~Program();
    Program(const Program&) = delete;
    Program& operator=(const Program&) = delete;

    Forms& forms();
    ZEL3Variables& variables();
    ZELBas& link();
    CommandExchange& exchange();
    TraceReader& traces();
    /// The sweeps of the last while.
    SweepHistory& history();
    Logs& logs();
    SessionLog& sessionLog();
    RoboHelp_CSH& help();
    ErrorReport& errorReport();
    Doctor& doctor();
    Clipboard& clipboard();
    FileService& files();
    Clock& clock();
    Interlock& interlock();
    Scripts& scripts();
    /// The sweep on the graph, be it read or loaded.
    Sweep& sweep();
    ServerBridge& server();
    ServerDialog& serverDialog();

    /// Start-up of the panel, to the moment it waits for the user. In server mode it returns when
    /// the server's window is closed; `ended` is then true.
    void start();
    /// Opens the link and does the handshake, through the connection dialog's routines, without
    /// showing the dialog. With `readTrace` one sweep is read and drawn as the dialog does. True
    /// when an instrument is connected.
    bool connect(const LinkAddress& address, bool readTrace);
    /// What to check after an attempt that found no instrument; empty when nothing is to be said.
    std::string connectionAdvice() const;
    /// The communication devices that have commands; "NONE" alone when there are none.
    std::vector<std::string> deviceNames();
    /// Sends a device its commands, through the dialog's routines. True when it took them.
    bool configureDevice(const std::string& name, const std::string& port, int baud);
    /// LOCAL and the close, without the question; nothing when not connected.
    void disconnect();

    /// The user closes the panel's window. False when the user chose to stay.
    bool requestClose();
    /// The program has come to its end; the front leaves its event loop.
    bool ended() const;
    /// The signal that ended it ("SIGTERM"); empty when none did.
    const std::string& endedBy() const;
    Event<> Ended;
    /// The instrument did not take a setting: the digit of its answer.
    Event<int> SettingRefused;
    /// The instrument has answered a query: its keyword and its value.
    Event<const std::string&, const std::string&> Answered;

    /// Reports the exception that is being handled and ends the program; call it inside a catch
    /// alone. A front catches what a handler, a timer or the line throws.
    void showFailure();
    /// A failure ended the program; its exit status is 1 then.
    bool failed() const;
    /// The file in which a fault leaves its trace.
    std::string crashFile() const;
    /// What a fault of an earlier run has left, which is put aside; empty for nothing.
    std::string takeCrash();
    /// Writes the session down in that file, as the option and the menu do.
    bool recordSession(const std::string& path, const std::string& arguments);

  private:
    std::unique_ptr<Guards> guards_;
    struct Rooms;
    std::unique_ptr<Rooms> rooms_;
};

}  // namespace zel
