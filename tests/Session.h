#pragma once
// The whole program on virtual time, with an instrument at its port that is a page of protocol.

#include <gtest/gtest.h>

#include <cstdint>
#include <string>
#include <vector>

#include "platform/virtual/VirtualPlatform.h"
#include "shell/Program.h"

namespace zel {

/// Samples as they come on the wire: four bytes each, least significant first, and the separator.
inline std::string traceBlock(const std::vector<std::int32_t>& samples) {
    std::string bytes;
    for (const std::int32_t sample : samples) {
        const auto word = static_cast<std::uint32_t>(sample);
        for (int shift = 0; shift < 32; shift += 8)
            bytes += static_cast<char>((word >> shift) & 0xFFU);
    }
    return bytes + '\0';
}

/// 301 times the same sample.
inline std::string levelBlock(std::int32_t sample) {
    return traceBlock(std::vector<std::int32_t>(301, sample));
}

struct TestSession {
    explicit TestSession(const std::string& commandLine = "")
        : program(platform.bundle(), commandLine) {}
    virtual ~TestSession() = default;

    VirtualPlatform platform;
    Program program;
    Forms& forms = program.forms();
    ControllerForm& panel = forms.controller;
    ZEL3Variables& mirror = program.variables();
    ScriptedPort& port = platform.port;
    RecordedBoxes& boxes = platform.boxes;

    /// Started, and as if the handshake on a serial port were done.
    void startConnected() {
        program.start();
        SerialSetup setup;
        setup.CommPort = "COM1";
        port.open(setup);
        panel.ConnectionState = ControllerForm::DIRECTCON;
        panel.isConnected = true;
        forms.main.IsConnectedToPort = true;
        program.link().RemoteAccepted = true;
    }

    // Steps of the dialogue, in the order of the calls.
    void cmd(const std::string& word, const std::string& status = "0") {
        line("cmd", word, status);
    }
    void set(const std::string& text, const std::string& status = "0") {
        line("set", text, status);
    }
    void get(const std::string& word, const std::string& value) {
        port.expect("GET\r").answer("0\r");
        port.expect(word + "\r").answer("0\r" + value + "\r");
    }
    void getRefused(const std::string& word, const std::string& status) {
        line("GET", word, status);
    }
    void getSilent() { port.expect("GET\r").silence(); }
    /// TRACEBIN with its block or blocks.
    void trace(const std::string& blocks) {
        port.expect("GET\r").answer("0\r");
        port.expect("TRACEBIN\r").answer("0\r" + blocks);
    }
    /// All that was to be sent was sent, and nothing else.
    void expectPlayed() const {
        EXPECT_EQ(platform.port.failure(), "");
        EXPECT_EQ(platform.port.leftOver(), "");
    }

  private:
    void line(const std::string& mode, const std::string& text, const std::string& status) {
        port.expect(mode + "\r").answer("0\r");
        port.expect(text + "\r").answer(status + "\r");
    }
};

}  // namespace zel
