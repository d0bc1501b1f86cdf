#pragma once
// The program before its session, and the page of protocol that a handshake is.

#include <map>
#include <string>
#include <utility>
#include <vector>

#include "tests/Session.h"
#include "tests/ShownBoxes.h"

namespace zel {

inline constexpr const char* kIdentity = "Marlow & Tenby,9102,12345,1.2";
inline constexpr const char* kAbsent =
    "critical | ZELRemote | No ZEL3 found at the specified address!";

/// Values of the handshake's queries that differ from the usual ones.
using Others = std::map<std::string, std::string>;

/// The dialogue of a handshake, in its order, written to a port or to a socket.
template <class Far>
class Page {
  public:
    explicit Page(Far& far, Others others = {}) : far_(far), others_(std::move(others)) {}

    Page& wake() {
        far_.expect("\r").answer("0\r");
        return *this;
    }
    Page& line(const std::string& mode, const std::string& text, const std::string& answer) {
        far_.expect(mode + "\r").answer("0\r");
        far_.expect(text + "\r").answer(answer + "\r");
        return *this;
    }
    Page& cmd(const std::string& word, const std::string& status = "0") {
        return line("cmd", word, status);
    }
    Page& set(const std::string& text, const std::string& status = "0") {
        return line("set", text, status);
    }
    Page& get(const std::string& word, const std::string& value) {
        const auto other = others_.find(word);
        return line("GET", word, "0\r" + (other == others_.end() ? value : other->second));
    }
    Page& identity() { return get("IDN?", kIdentity); }
    Page& detectorModeAndFrequency() {
        return get("TRACEDET", "3").get("MEAS", "1").get("FREQ", "1500000000");
    }
    /// What is asked in every mode but that of the power sensor.
    Page& state() {
        get("SPAN", "1000000").get("UNIT", "0").get("REFLVL", "-20").get("RANGE", "1");
        get("DYNRANGE", "1").get("SWPTIME", "0.02").get("SWPCONT", "1");
        const auto other = others_.find("SWPCONT");
        if (other == others_.end() || other->second != "0") cmd("INIT");
        return get("RBW", "4").get("VBW", "5");
    }
    /// The whole handshake on the first visit of the frequency menu.
    Page& whole() {
        wake().cmd("REMOTE").identity().detectorModeAndFrequency().state();
        return get("FREQOFFS", "0");
    }

  private:
    Far& far_;
    Others others_;
};

struct Bench : TestSession {
    explicit Bench(const std::string& commandLine = "") : TestSession(commandLine) {
        platform.ports.ports = {"COM1", "COM3"};
        program.start();
    }
    ZELBas& line = program.link();
    MainForm& dialog = forms.main;
    ScriptedSocket& socket = platform.tcpSocket;

    Page<ScriptedPort> page(Others others = {}) { return Page(port, std::move(others)); }
    /// Opens the port and does the handshake without a trace after it.
    bool connect() { return program.connect({LinkAddress::Kind::Serial, "COM3", 57600}, false); }
    bool connectTcp() { return program.connect({LinkAddress::Kind::Tcp, "host", 2277}, false); }
    Texts shown() const { return shownBoxes(platform.boxes); }
    std::int64_t now() const { return platform.clock.micros() / 1000; }
    template <class Work>
    std::int64_t time(const Work& work) const {
        const std::int64_t start = now();
        work();
        return now() - start;
    }
    /// A user acts so many milliseconds from now.
    void later(int ms, std::function<void()> act) { platform.events.schedule(ms, std::move(act)); }
    std::string status() const { return forms.controller.DebugTextBox.Text.get(); }
};

struct Connection : Bench, ::testing::Test {};

}  // namespace zel
