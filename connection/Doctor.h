#pragma once
// Finds out what is wrong on the way to the instrument: the ports, their rights and holders, what
// comes back over the line.

#include <functional>
#include <optional>
#include <string>
#include <vector>

#include "platform/Clock.h"
#include "platform/Events.h"
#include "platform/LinkAddress.h"
#include "platform/PortProbe.h"
#include "platform/SerialPort.h"
#include "platform/Socket.h"

namespace zel {

struct Finding {
    enum class Grade { Ok, Warning, Fault };
    Grade grade = Grade::Ok;
    std::string name;    ///< what was looked at, one word
    std::string text;    ///< what was found
    std::string remedy;  ///< what to do, one sentence; empty where nothing is to be done
};

/// "fault rights: TEXT; REMEDY".
std::string findingLine(const Finding& finding);

/// Nothing is written to a port that another program holds, nor to a line that is in use here.
class Doctor {
  public:
    struct Services {
        PortProbe& probe;
        SerialPort& port;
        Socket& socket;
        const Clock& clock;
        Events& events;
    };
    explicit Doctor(const Services& services) : s_(services) {}

    /// Looks at the connection, or without one at all serial ports; each finding is given at once.
    /// False when one of them is a fault.
    bool examine(const std::optional<LinkAddress>& address,
                 const std::function<void(const Finding&)>& found);
    /// The first of the rates at which an instrument answers on that port, without a word to the
    /// user; `trying` hears each rate before it is tried. Nothing when none answers, when the port
    /// cannot be had, or after `stop`.
    std::optional<int> findRate(const std::string& port, const std::vector<int>& rates,
                                const std::function<void(int)>& trying);
    /// Ends an examination or a search that is under way.
    void stop() { stopped_ = true; }

  private:
    /// Bytes to and from a line, be it a port or a socket.
    struct Line {
        std::function<void(const std::string&)> send;
        std::function<std::string()> take;
    };
    struct Answer {
        std::string identity;  ///< of the instrument; empty when none answered
        std::string came;      ///< what came back instead
        bool echo = false;     ///< what was sent came back
    };

    void tell(Finding::Grade grade, const std::string& name, const std::string& text,
              const std::string& remedy = {});
    void listDevices(const std::vector<SerialDevice>& devices);
    void examinePort(const LinkAddress& address);
    bool mayUse(const std::string& path);
    bool isFree(const std::string& path);
    void showLines(const std::string& path);
    void search(const LinkAddress& address);
    void askModem(const LinkAddress& address);
    void examineServer(const LinkAddress& address);
    bool openPort(const std::string& path, int baud);
    void tellNotOpened(const std::string& path);
    Line portLine();
    Answer ask(const Line& line);
    std::string collect(const Line& line, int ms, int ends);

    Services s_;
    std::function<void(const Finding&)> found_;
    bool stopped_ = false;
    bool faults_ = false;
};

}  // namespace zel
