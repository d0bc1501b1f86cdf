#pragma once
// The program with the simulated instrument behind a line that fails where the test says, and a
// check that whatever is shown as a whole trace is what the instrument sent.

#include <cstdint>
#include <memory>
#include <set>
#include <string>
#include <string_view>
#include <vector>

#include "ZELSim/InProcessPort.h"
#include "link/CommandExchange.h"
#include "platform/virtual/VirtualPlatform.h"
#include "shell/Program.h"
#include "tests/server/NetworkSetup.h"
#include "trace/TraceReader.h"

namespace zel {

/// Drop: one byte is lost. Garble, Flip: one byte arrives with other bits, or with its lowest bit
/// changed. Silence: nothing comes from that byte on. Pause: it and all after it come late.
/// Close: the line ends before it.
enum class LineFault { None, Drop, Garble, Flip, Silence, Pause, Close };
inline constexpr LineFault kLineFaults[] = {LineFault::Drop,  LineFault::Garble,
                                            LineFault::Flip,  LineFault::Silence,
                                            LineFault::Pause, LineFault::Close};
const char* nameOf(LineFault fault);

/// The way to the instrument. Served: over TCP to a server at the instrument's serial line, which
/// is where the faults are.
enum class LineKind { Serial, Tcp, Served };

/// Sees every byte between program and instrument, and spoils one.
class TruthTap {
  public:
    TruthTap(const Clock& clock, Events& events) : clock_(clock), events_(events) {}

    /// Byte `at` of those to come, counted from 0, meets the fault; `pauseMs` is for a pause.
    void arm(LineFault fault, long at, int pauseMs = 12000);
    void heal() { arm(LineFault::None, 0); }
    /// What the program sends.
    void sent(std::string_view bytes);
    /// What the instrument sends; the result reaches the program.
    std::string pass(const std::string& bytes);
    /// The line ended at the fault.
    bool closed() const { return closed_; }
    void reopened() { closed_ = false; }
    /// Late bytes are due now.
    Event<> Woke;
    /// Late bytes are due at this moment (us); -1 for none.
    std::int64_t lateAt() const { return late_.empty() ? -1 : lateAt_; }

    long passed() const { return passed_; }
    long exchanges() const { return exchanges_; }
    long faults() const { return faults_; }
    /// The samples that the instrument sent for the last TRACEBIN, with the bits as the line left
    /// them; fewer than a block where it sent fewer.
    const std::string& lastBlock() const { return block_; }
    /// The last answer about this word met a fault that no host can notice.
    bool spoiled(const std::string& word) const { return spoiled_.contains(word); }

  private:
    const Clock& clock_;
    Events& events_;
    LineFault fault_ = LineFault::None;
    long left_ = 0;  ///< bytes before the fault
    int pauseMs_ = 0;
    bool silent_ = false;
    bool closed_ = false;
    std::string late_;
    std::int64_t lateAt_ = 0;
    long passed_ = 0;
    long exchanges_ = 0;
    long faults_ = 0;
    std::string line_;  ///< of the program, not ended yet
    std::string word_;  ///< last line of the program
    std::string block_;
    bool inBlock_ = false;
    bool clean_ = true;  ///< no fault since the last line of the program
    int lines_ = 0;      ///< of the instrument since then
    std::set<std::string> spoiled_;
};

/// The tap as a serial port.
class TruthPort : public SerialPort {
  public:
    TruthPort(SerialPort& inner, TruthTap& tap) : inner_(inner), tap_(tap) {
        inner_.OnComm.connect([this](int code) { OnComm(code); });
        tap_.Woke.connect([this] { OnComm(2); });
    }
    bool open(const SerialSetup& setup) override;
    void close() override { inner_.close(); }
    bool isOpen() const override { return inner_.isOpen() && !tap_.closed(); }
    std::string input() override;
    void output(std::string_view bytes) override;
    std::string problem() const override { return tap_.closed() ? "The port has gone." : ""; }

  private:
    SerialPort& inner_;
    TruthTap& tap_;
};

/// The tap as a socket.
class TruthSocket : public Socket {
  public:
    TruthSocket(SerialPort& inner, TruthTap& tap) : inner_(inner), tap_(tap) {
        inner_.OnComm.connect([this](int) { DataArrival(); });
    }
    void connectTo(const std::string& host, int port) override;
    void connectTls(const std::string& host, int port, const std::string&) override {
        connectTo(host, port);
    }
    void close() override;
    SocketState state() const override;
    bool sendData(std::string_view bytes) override;
    std::string peekData() override;
    std::string getData() override;
    std::size_t bytesToWrite() const override { return 0; }
    std::string problem() const override { return {}; }

  private:
    void fetch();
    SerialPort& inner_;
    TruthTap& tap_;
    bool connected_ = false;
    std::string waiting_;
};

/// A second copy of the program: the server at the line, and a socket that leads to it.
class ServedEnd {
  public:
    ServedEnd(VirtualPlatform& desk, SerialPort& line);
    /// At the start, and where the line had ended.
    bool serve();
    ServerBridge& bridge() { return server_.server(); }
    PipeSocket& socket() { return socket_; }

  private:
    VirtualPlatform far_;
    PipeSocket socket_;
    PipeServer listener_;
    Program server_;
};

/// One run: a session whose every result is held against the instrument.
class TruthRun {
  public:
    explicit TruthRun(LineKind kind, std::uint64_t seed = 1);

    bool connect();
    /// The line of the session has not ended.
    bool lineIsUp() const { return !tap.closed(); }
    void disconnect() { program.disconnect(); }
    /// A full or a selective read cycle, with its checks.
    void readTrace(bool full);
    void setDetector(int code);
    void set(const std::string& text) { program.exchange().SetInstrument(text); }
    /// A recording of so many ticks, with the checks of its file.
    void record(int ticks);
    /// The whole session of the sweep: handshake, two settings, three sweeps in three detectors, a
    /// recording of three.
    void wholeSession();

    /// What was shown as true and is not; empty while all is well.
    std::vector<std::string> findings;
    long wholeTraces = 0;
    long incompleteTraces = 0;

    VirtualPlatform platform;
    zelsim::InProcessPort instrument;
    TruthTap tap{platform.clock, platform.events};
    TruthPort port{instrument, tap};
    TruthSocket socket{instrument, tap};
    std::unique_ptr<ServedEnd> served;  ///< null where there is no server
    Program program;
    ControllerForm& panel = program.forms().controller;

  private:
    void check(const Sweep& sweep, const char* where);
    void checkSettings(const Sweep& sweep, const std::string& head);
    std::vector<double> sentSamples(const Sweep& sweep) const;
    void checkPart(const Sweep& sweep);
    void checkGraph();
    void checkFile();
    void finding(const std::string& text);

    LineKind kind_;
    std::vector<Sweep> saved_;  ///< what the recording wrote
};

}  // namespace zel
