#pragma once
// The program with the simulated instrument behind a line that falls silent, or dies, at a line of
// the test's choice.

#include <gtest/gtest.h>

#include <functional>
#include <ostream>
#include <string>
#include <string_view>

#include "ZELSim/InProcessPort.h"
#include "link/CommandExchange.h"
#include "platform/virtual/VirtualPlatform.h"
#include "shell/Program.h"
#include "tests/panel/Panel.h"

namespace zel {

enum class End { Silent, Dead };

/// A silent line takes bytes and gives none, as an instrument that was switched off; a dead one is
/// closed until it is opened again.
class FailingPort : public SerialPort {
  public:
    explicit FailingPort(SerialPort& inner) : inner_(inner) {
        inner_.OnComm.connect([this](int code) {
            if (!silent_) OnComm(code);
        });
    }
    /// Fails with the line of that number that the program sends from now on, from 1; 0: never.
    void failAt(int line, End end) {
        failAt_ = line;
        end_ = end;
        lines_ = 0;
        silent_ = false;
    }
    /// The instrument was switched on again and knows nothing of a half exchange.
    void mend() {
        failAt(0, End::Silent);
        if (!dead_) inner_.open(setup_);
    }
    int lines() const { return lines_; }
    bool failed() const { return silent_ || dead_; }
    /// The line with which it failed.
    const std::string& lastLine() const { return lastLine_; }

    bool open(const SerialSetup& setup) override {
        dead_ = false;
        setup_ = setup;
        return inner_.open(setup);
    }
    void close() override { inner_.close(); }
    bool isOpen() const override { return !dead_ && inner_.isOpen(); }
    std::string problem() const override { return inner_.problem(); }
    std::string input() override {
        const std::string bytes = inner_.input();
        return silent_ ? std::string() : bytes;
    }
    void output(std::string_view bytes) override {
        if (++lines_ == failAt_) {
            lastLine_ = bytes;
            silent_ = end_ == End::Silent;
            dead_ = end_ == End::Dead;
            if (dead_) inner_.close();
        }
        if (!failed()) inner_.output(bytes);
    }

  private:
    SerialPort& inner_;
    SerialSetup setup_;
    std::string lastLine_;
    End end_ = End::Silent;
    int failAt_ = 0;
    int lines_ = 0;
    bool silent_ = false;
    bool dead_ = false;
};

struct DeadLineSetup {
    VirtualPlatform platform;
    zelsim::InProcessPort instrument{platform.clock, platform.events};
    FailingPort line{instrument};
    Program program{platform.bundle(line), ""};
    ControllerForm& panel = program.forms().controller;
    RecordedBoxes& boxes = platform.boxes;

    DeadLineSetup() {
        program.start();
        connect();
    }
    void connect() {
        EXPECT_TRUE(program.connect({LinkAddress::Kind::Serial, "COM1", 57600}, false));
    }
    bool answers(std::string& measurement) {
        return program.exchange().GetInstrument("MEAS", measurement);
    }
};

/// A handler of the panel, and what stands before it on a good line.
struct Handler {
    std::string name;
    std::function<void(ControllerForm&)> ready;
    std::function<void(ControllerForm&)> work;
    std::string failure = {};  ///< its own words, where its first exchange fails
    bool leavesPlayDisabled = false;
};

inline void PrintTo(const Handler& handler, std::ostream* out) { *out << handler.name; }

}  // namespace zel
