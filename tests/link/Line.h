#pragma once
// The link's routines on virtual time, with an instrument that is a page of protocol.

#include <gtest/gtest.h>

#include <cstdint>
#include <functional>
#include <string>
#include <vector>

#include "forms/Forms.h"
#include "link/AnswerReader.h"
#include "link/BinaryReader.h"
#include "link/BinaryTrace.h"
#include "link/ByteLink.h"
#include "link/CommandExchange.h"
#include "platform/virtual/VirtualPlatform.h"
#include "tests/ShownBoxes.h"

namespace zel {

/// The debug channel with the moment of each text.
struct StampedDebug : DebugChannel {
    struct Entry {
        std::int64_t ms;
        std::string text;
    };
    explicit StampedDebug(const Clock& clock) : clock_(clock) {}

    std::vector<Entry> entries;
    std::function<void(const std::string&)> whenSpoken;

    void output(const std::string& text) override {
        entries.push_back({clock_.micros() / 1000, text});
        if (whenSpoken) whenSpoken(text);
    }
    /// Moment of the first such text; -1 when there is none.
    std::int64_t momentOf(const std::string& text) const {
        for (const Entry& entry : entries)
            if (entry.text == text) return entry.ms;
        return -1;
    }
    Texts texts() const {
        Texts all;
        for (const Entry& entry : entries) all.push_back(entry.text);
        return all;
    }

  private:
    const Clock& clock_;
};

/// A direct serial link in session, at its beginning.
struct LineSetup {
    LineSetup() {
        SerialSetup setup;
        setup.CommPort = "COM1";
        port.open(setup);
        dialog.IsConnectedToPort = true;
        panel.ConnectionState = ControllerForm::DIRECTCON;
        panel.isConnected = true;
        state.RemoteAccepted = true;
    }

    VirtualPlatform platform;
    ScriptedPort& port = platform.port;
    ScriptedSocket& socket = platform.tcpSocket;
    RecordedBoxes& boxes = platform.boxes;
    VirtualEvents& events = platform.events;
    StampedDebug debug{platform.clock};
    Forms forms;
    ControllerForm& panel = forms.controller;
    MainForm& dialog = forms.main;
    ZELBas state;
    Session session{platform.clock, events, boxes, panel.DebugTextBox};
    ByteLink link{forms, state, port, socket, session, debug};
    AnswerReader reader{forms, state, link, session};
    CommandExchange exchange{panel, state, link, reader, session};
    BinaryReader byteReader{forms, state, link, session};
    BinaryTrace binary{panel, state, link, reader, byteReader, session};

    /// The same session over a socket, whose script is `socket`.
    void overTcp() {
        panel.ConnectionState = ControllerForm::TCPCON;
        port.close();
        dialog.IsConnectedToPort = false;
        socket.connectTo("host", 2277);
        events.pump();
    }
    /// As while the handshake runs.
    void whileConnecting() {
        panel.isConnected = false;
        state.RemoteAccepted = false;
    }

    std::int64_t now() const { return platform.clock.micros() / 1000; }
    /// Milliseconds that the work takes.
    std::int64_t time(const std::function<void()>& work) const {
        const std::int64_t start = now();
        work();
        return now() - start;
    }
    std::string status() const { return panel.DebugTextBox.Text.get(); }
    Texts shown() const { return shownBoxes(boxes); }
    void expectPlayed() const {
        EXPECT_EQ(platform.port.failure(), "");
        EXPECT_EQ(platform.port.leftOver(), "");
        EXPECT_EQ(platform.tcpSocket.failure(), "");
        EXPECT_EQ(platform.tcpSocket.leftOver(), "");
    }
    /// Mode word and second line with their statuses, on the serial line.
    void exchangeOf(const std::string& mode, const std::string& text, const std::string& answer) {
        port.expect(mode + "\r").answer("0\r");
        port.expect(text + "\r").answer(answer);
    }
};

struct Line : LineSetup, ::testing::Test {};

/// The kinds of connection over the serial port.
inline constexpr std::int16_t kSerialKinds[] = {ControllerForm::DIRECTCON, ControllerForm::MODEMCON,
                                                ControllerForm::GSMCON, ControllerForm::MODEMGSMCON,
                                                ControllerForm::GSMMODEMCON};

}  // namespace zel
