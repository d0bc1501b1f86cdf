#include "connection/Doctor.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <vector>

#include "platform/ByteText.h"
#include "platform/LinkAddress.h"
#include "platform/PortProbe.h"
#include "platform/SerialPort.h"
#include "platform/Socket.h"
#include "support/Text.h"

namespace zel {
namespace {

using Grade = Finding::Grade;

constexpr int kRates[] = {57600, 115200, 38400, 19200, 9600};
constexpr int kUsualRate = 57600;
constexpr int kWakeMs = 300;
constexpr int kAnswerMs = 600;
constexpr int kIdentityMs = 1500;
constexpr int kModemMs = 2000;
constexpr int kReachMs = 5000;
constexpr int kLookMs = 20;
constexpr std::size_t kMostPorts = 4;
constexpr std::size_t kMostShown = 12;  // bytes
constexpr std::size_t kMostTaken = 4096;

const char* gradeText(Grade grade) {
    if (grade == Grade::Ok) return "ok";
    return grade == Grade::Warning ? "warning" : "fault";
}

std::string oneLine(const std::string& text) {
    return replaceAll(replaceAll(text, "\r", " "), "\n", " ");
}

/// The first sentence of a reason without its point; what to do stands in the remedy.
std::string reason(const std::string& text, const std::string& path) {
    const std::size_t from = startsWith(text, path) ? path.size() : 0;  // a name may hold points
    std::string first = text.substr(0, text.find(". ", from));
    if (!first.empty() && first.back() == '.') first.pop_back();
    return first;
}

std::string bytesText(const std::string& bytes) {
    if (bytes.empty()) return "nothing";
    std::string text;
    for (std::size_t i = 0; i < bytes.size() && i < kMostShown; ++i)
        text += (i == 0 ? "" : " ") + hexOf(bytes[i]);
    return bytes.size() > kMostShown ? text + " ..." : text;
}

std::string deviceText(const SerialDevice& device) {
    std::string text = device.path + ":";
    if (!device.maker.empty()) text += " " + device.maker;
    if (!device.product.empty()) text += " " + device.product;
    if (device.maker.empty() && device.product.empty()) text += " no maker is known";
    return text + ", " +
           (device.serialNumber.empty() ? std::string("no serial number")
                                        : "serial number " + device.serialNumber);
}

}  // namespace

std::string findingLine(const Finding& finding) {
    std::string line =
        std::string(gradeText(finding.grade)) + " " + finding.name + ": " + oneLine(finding.text);
    if (!finding.remedy.empty()) line += "; " + oneLine(finding.remedy);
    return line;
}

void Doctor::tell(Grade grade, const std::string& name, const std::string& text,
                  const std::string& remedy) {
    faults_ = faults_ || grade == Grade::Fault;
    found_({grade, name, text, remedy});
}

bool Doctor::examine(const std::optional<LinkAddress>& address,
                     const std::function<void(const Finding&)>& found) {
    found_ = found;
    stopped_ = false;
    faults_ = false;
    if (address && address->overNetwork()) {
        examineServer(*address);
        return !faults_;
    }
    const std::vector<SerialDevice> devices = s_.probe.devices();
    listDevices(devices);
    for (const std::string& manager : s_.probe.modemManagers())
        tell(Grade::Warning, "manager", manager + " runs and may open serial ports",
             "Stop it with \"systemctl stop " + manager +
                 "\", or install the udev rule of the package zelremote-server, which keeps it off "
                 "the port.");
    if (address) {
        examinePort(*address);
        return !faults_;
    }
    for (std::size_t i = 0; i < devices.size() && i < kMostPorts && !stopped_; ++i)
        examinePort({LinkAddress::Kind::Serial, devices[i].path, kUsualRate});
    return !faults_;
}

void Doctor::listDevices(const std::vector<SerialDevice>& devices) {
    if (devices.empty())
        return tell(Grade::Warning, "device", "no serial port was found",
                    "Plug the cable in, or type the name of the device.");
    for (const SerialDevice& device : devices) tell(Grade::Ok, "device", deviceText(device));
}

void Doctor::examinePort(const LinkAddress& address) {
    if (s_.port.isOpen())
        return tell(Grade::Ok, "port",
                    "a session is under way on the serial port; it was left alone");
    if (!mayUse(address.port) || !isFree(address.port) || stopped_) return;
    showLines(address.port);
    if (address.dialled()) {
        askModem(address);
    } else {
        search(address);
    }
    s_.port.close();
}

bool Doctor::mayUse(const std::string& path) {
    const PortAccess access = s_.probe.access(path);
    if (!access.exists) {
        tell(Grade::Fault, "port", path + " is not there",
             "Check the cable and the name of the port.");
        return false;
    }
    if (!access.terminal) {
        tell(Grade::Fault, "port", path + " is no serial port",
             "Choose the name of a serial port.");
        return false;
    }
    if (access.usable) {
        tell(Grade::Ok, "rights", path + " may be read and written");
        return true;
    }
    std::string remedy =
        "Install the udev rule of the package zelremote-server, or ask the administrator for "
        "rights.";
    if (!access.group.empty())
        remedy =
            access.member
                ? "Log out and in again, so that your group \"" + access.group + "\" takes effect."
                : "Add yourself to the group \"" + access.group + "\" with \"sudo usermod -aG " +
                      access.group + " $USER\", then log out and in again.";
    tell(Grade::Fault, "rights", "no rights to use " + path, remedy);
    return false;
}

bool Doctor::isFree(const std::string& path) {
    const PortHolders holders = s_.probe.holders(path);
    bool free = true;
    for (const PortHolder& holder : holders.found) {
        if (holder.self) continue;
        free = false;
        tell(Grade::Fault, "holder",
             path + " is held by " + holder.name + " (process " + std::to_string(holder.process) +
                 ")",
             "Close " + holder.name + ", then run the doctor again.");
    }
    if (free)
        tell(Grade::Ok, "holder",
             holders.complete ? "no program holds " + path
                              : "no program that this user may look at holds " + path);
    return free;
}

void Doctor::showLines(const std::string& path) {
    const std::optional<ModemLines> lines = s_.probe.modemLines(path);
    if (!lines) return tell(Grade::Ok, "lines", path + " has no modem lines");
    const auto word = [](const char* name, bool on) {
        return std::string(name) + (on ? " on" : " off");
    };
    const std::string text = word("CTS", lines->cts) + ", " + word("DSR", lines->dsr) + ", " +
                             word("DCD", lines->dcd) + ", " + word("RI", lines->ri);
    if (lines->cts || lines->dsr || lines->dcd) return tell(Grade::Ok, "lines", text);
    tell(Grade::Warning, "lines", text,
         "Check that the instrument is on and the cable is plugged in at both ends.");
}

bool Doctor::openPort(const std::string& path, int baud) {
    s_.port.close();
    SerialSetup setup;
    setup.CommPort = path;
    setup.Settings = std::to_string(baud) + ",N,8,1";
    if (!s_.port.open(setup)) return false;
    // Another program may have come in between.
    for (const PortHolder& holder : s_.probe.holders(path).found)
        if (!holder.self) {
            s_.port.close();
            return false;
        }
    s_.port.input();
    return true;
}

void Doctor::tellNotOpened(const std::string& path) {
    const std::string why = reason(s_.port.problem(), path);
    const bool held = why.empty() || contains(why, "held");
    tell(Grade::Fault, "open", why.empty() ? path + " could not be opened" : why,
         held ? "Close the program that uses the port, then run the doctor again."
              : "Plug the adapter out and in, or choose another port or speed.");
}

Doctor::Line Doctor::portLine() {
    return {[this](const std::string& bytes) { s_.port.output(bytes); },
            [this] { return s_.port.input(); }};
}

/// What comes within the time, or until so many carriage returns have come.
std::string Doctor::collect(const Line& line, int ms, int ends) {
    const std::int64_t until = s_.clock.micros() + std::int64_t{ms} * 1000;
    std::string bytes;
    while (!stopped_) {
        bytes += line.take();
        if (ends > 0 && std::count(bytes.begin(), bytes.end(), '\r') >= ends) break;
        if (s_.clock.micros() >= until || bytes.size() > kMostTaken) break;
        s_.events.wait(kLookMs);
    }
    return bytes;
}

/// One exchange as the session does it, without taking the instrument over.
Doctor::Answer Doctor::ask(const Line& line) {
    line.send("\r");
    const std::string woken = collect(line, kWakeMs, 0);
    // A CR may have ended an exchange of somebody else: the second time counts.
    std::string status;
    for (int i = 0; i < 2 && !stopped_; ++i) {
        line.send("GET\r");
        status = collect(line, kAnswerMs, 1);
        if (status == "0\r" || status == "GET\r" || status.empty()) break;
    }
    if (status == "GET\r") return {"", woken + status, true};
    if (status != "0\r") return {"", woken + status, false};
    line.send("IDN?\r");
    const std::string answer = collect(line, kIdentityMs, 2);
    const std::vector<std::string> parts = split(answer, '\r');
    if (parts.size() < 3 || parts[0] != "0" || parts[1].empty())
        return {"", woken + status + answer, false};
    return {parts[1], "", false};
}

void Doctor::search(const LinkAddress& address) {
    std::vector<int> rates;
    if (address.number > 0) rates.push_back(address.number);
    for (const int rate : kRates)
        if (std::find(rates.begin(), rates.end(), rate) == rates.end()) rates.push_back(rate);
    std::string tried;
    bool noise = false;
    for (const int rate : rates) {
        if (stopped_) return;
        const std::string baud = std::to_string(rate);
        if (!openPort(address.port, rate)) {
            return tellNotOpened(address.port);
        }
        const Answer answer = ask(portLine());
        if (answer.echo)
            return tell(Grade::Warning, "loopback",
                        "what was sent to " + address.port + " came back as it was",
                        "Take the loopback plug off, or switch the echo off, and connect the "
                        "instrument.");
        if (!answer.identity.empty()) {
            tell(Grade::Ok, "loopback", "nothing of what was sent came back");
            const std::string text =
                "an instrument answers at " + baud + " baud: " + answer.identity;
            if (rate == rates.front() || address.number <= 0)
                return tell(Grade::Ok, "search", text);
            return tell(Grade::Warning, "search", text,
                        "Choose " + baud + " baud for the connection.");
        }
        noise = noise || !answer.came.empty();
        tried += (tried.empty() ? "" : ", ") + baud + " " + bytesText(answer.came);
    }
    if (stopped_) return;
    tell(Grade::Ok, "loopback", "nothing of what was sent came back");
    tell(Grade::Fault, "search", "no instrument answers; what came at each speed: " + tried,
         noise ? "Check that the far end is a ZEL3 instrument, and set its port to 57600 baud."
               : "Switch the instrument on and check the cable, which has to cross the two data "
                 "lines.");
}

std::optional<int> Doctor::findRate(const std::string& port, const std::vector<int>& rates,
                                    const std::function<void(int)>& trying) {
    stopped_ = false;
    std::optional<int> found;
    if (s_.port.isOpen()) return found;
    for (const int rate : rates) {
        trying(rate);
        if (stopped_ || !openPort(port, rate)) break;
        if (!ask(portLine()).identity.empty() && !stopped_) found = rate;
        if (found || stopped_) break;
    }
    s_.port.close();
    return found;
}

void Doctor::askModem(const LinkAddress& address) {
    if (!openPort(address.port, address.number > 0 ? address.number : kUsualRate)) {
        return tellNotOpened(address.port);
    }
    const Line line = portLine();
    line.send("AT\r");
    const std::string answer = collect(line, kModemMs, 0);
    if (stopped_) return;
    if (contains(answer, "OK")) return tell(Grade::Ok, "modem", "a modem answers: OK");
    tell(Grade::Fault, "modem", "no modem answers; what came: " + bytesText(answer),
         "Switch the modem on and choose the baud rate that it works at.");
}

void Doctor::examineServer(const LinkAddress& address) {
    const std::string host = contains(address.port, ":") ? "[" + address.port + "]" : address.port;
    const std::string place = host + ":" + std::to_string(address.number);
    if (s_.socket.state() == SocketState::Connected)
        return tell(Grade::Ok, "reach", "a session is under way over TCP; it was left alone");
    s_.socket.close();
    const bool tls = address.kind == LinkAddress::Kind::Tls;
    if (tls) {
        s_.socket.connectTls(address.port, address.number, address.pinned);
    } else {
        s_.socket.connectTo(address.port, address.number);
    }
    const std::int64_t until = s_.clock.micros() + std::int64_t{kReachMs} * 1000;
    while (!stopped_ && s_.socket.state() == SocketState::Connecting && s_.clock.micros() < until)
        s_.events.wait(kLookMs);
    if (stopped_) return s_.socket.close();
    if (s_.socket.state() != SocketState::Connected) {
        std::string why = reason(s_.socket.problem(), {});
        if (why.empty())
            why = std::string(tls ? "no TLS handshake" : "no answer") + " within " +
                  std::to_string(kReachMs / 1000) + " s";
        s_.socket.close();
        return tell(Grade::Fault, "reach", place + " cannot be reached: " + why,
                    "Check the address, the port and the firewall, and that the server runs.");
    }
    tell(Grade::Ok, "reach", place + " can be reached");
    const Answer answer = ask({[this](const std::string& bytes) { s_.socket.sendData(bytes); },
                               [this] { return s_.socket.getData(); }});
    s_.socket.close();
    if (stopped_) return;
    if (!answer.identity.empty())
        return tell(Grade::Ok, "server", "a server with an instrument answers: " + answer.identity);
    tell(Grade::Fault, "server",
         answer.came.empty()
             ? "nothing answers at " + place
             : "no instrument answers at " + place + "; what came: " + bytesText(answer.came),
         answer.came.empty() ? "Check that the server's instrument is on and that no other client "
                               "is at work."
                             : "Check that the port is that of a ZELRemote server.");
}

}  // namespace zel
