#pragma once
// The program with the simulated instrument at its port, and a line between them that fails at a
// byte of the test's choice.

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdint>
#include <functional>
#include <string>
#include <utility>
#include <vector>

#include "ZELSim/InProcessPort.h"
#include "link/CommandExchange.h"
#include "platform/virtual/FaultyPort.h"
#include "platform/virtual/VirtualPlatform.h"
#include "shell/Program.h"
#include "support/NumberText.h"
#include "tests/ShownBoxes.h"
#include "trace/TraceReader.h"

namespace zel {

/// A line that loses one byte on its way to the program.
class LosingPort : public SerialPort {
  public:
    explicit LosingPort(SerialPort& inner) : inner_(inner) {
        inner_.OnComm.connect([this](int code) { OnComm(code); });
    }
    /// The byte of that number from now on, from 0; -1 for none.
    void loseByte(long position) {
        lost_ = position;
        taken_ = 0;
    }
    bool open(const SerialSetup& setup) override { return inner_.open(setup); }
    void close() override { inner_.close(); }
    bool isOpen() const override { return inner_.isOpen(); }
    void output(std::string_view bytes) override {
        if (spoken) spoken(bytes);
        inner_.output(bytes);
    }
    /// Gets what the program sends; may be empty.
    std::function<void(std::string_view)> spoken;
    std::string problem() const override { return inner_.problem(); }
    std::string input() override {
        std::string bytes = inner_.input();
        const long at = lost_ - taken_;
        taken_ += static_cast<long>(bytes.size());
        if (lost_ >= 0 && at >= 0 && at < static_cast<long>(bytes.size()))
            bytes.erase(static_cast<std::size_t>(at), 1);
        return bytes;
    }

  private:
    SerialPort& inner_;
    long lost_ = -1;
    long taken_ = 0;
};

/// A split is a pause too short to be noticed, a stall one that is shorter than any time-out.
enum class Fault { Dies, Splits, Stalls, Garbles, Loses };
inline constexpr Fault kFaults[] = {Fault::Dies, Fault::Splits, Fault::Stalls, Fault::Garbles,
                                    Fault::Loses};
inline constexpr int kStallMs = 3000;
inline constexpr const char* kFaultNames[] = {"dies", "splits", "stalls", "garbles", "loses"};

struct FaultSetup {
    VirtualPlatform platform;
    zelsim::InProcessPort instrument{platform.clock, platform.events};
    FaultyPort faulty{instrument, platform.events};
    LosingPort line{faulty};
    Program program{platform.bundle(line), ""};
    ControllerForm& panel = program.forms().controller;

    FaultSetup() { program.start(); }

    void arm(Fault fault, long byte) {
        LineFaults faults;
        if (fault == Fault::Dies) faults.dropAt = byte;
        if (fault == Fault::Splits || fault == Fault::Stalls) faults.splitAt = byte;
        faults.splitPauseMs = fault == Fault::Stalls ? kStallMs : 15;
        if (fault == Fault::Garbles) faults.garbleAt = byte;
        faulty.arm(faults);
        line.loseByte(fault == Fault::Loses ? byte : -1);
    }
    void goodLine() {
        faulty.disarm();
        line.loseByte(-1);
    }
    bool connect() { return program.connect({LinkAddress::Kind::Serial, "COM1", 57600}, false); }
    bool get(const std::string& word, std::string& value) {
        return program.exchange().GetInstrument(word, value);
    }
    bool set(const std::string& text) { return program.exchange().SetInstrument(text); }
    bool readTrace() {
        bool success = false;
        program.traces().ReadSingleTrace2({}, success);
        return success;
    }
    /// Milliseconds that the work takes.
    template <class Work>
    std::int64_t time(const Work& work) const {
        const std::int64_t start = platform.clock.micros();
        work();
        return (platform.clock.micros() - start) / 1000;
    }
    /// The bytes that the work receives on a good line.
    template <class Work>
    long bytesOf(const Work& work) {
        goodLine();
        work();
        return faulty.received();
    }
    /// The session after a line that died: ended by the user and begun again.
    bool reconnect() {
        program.disconnect();
        return connect();
    }
    /// The centre frequency as the instrument has it.
    bool asksRightCentre() {
        std::string value;
        return get("FREQ", value) && leadingNumber(value) == instrument.device().settings().centre;
    }
};

}  // namespace zel
