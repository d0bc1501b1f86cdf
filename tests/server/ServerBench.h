#pragma once
// The server with a scripted instrument at its port and a scripted client at its socket.

#include <gtest/gtest.h>

#include "server/ServerBridge.h"
#include "server/ServerDialog.h"
#include "tests/Session.h"
#include "tests/ShownBoxes.h"

namespace zel {

inline constexpr const char* kNoise = "\xF8\x9C";
inline constexpr const char* kIdentity = "0\rMarlow & Tenby,9102,12345,1.2\r";

struct ServerBench : TestSession {
    explicit ServerBench(const std::string& words = "") : TestSession(words) {
        platform.ports.ports = {"COM1", "COM3"};
        platform.serverSocket.setLocalIP("192.168.1.7");
        program.server().Happened.connect(
            [this](const std::string& text) { happened.push_back(text); });
    }
    ServerForm& form = forms.server;
    ScriptedPort& line = platform.serverPort;
    ScriptedServer& server = platform.serverSocket;
    ScriptedSocket& client = platform.serverSocket.far();
    Texts happened;

    Texts shown() const { return shownBoxes(platform.boxes); }
    void later(int ms, std::function<void()> act) { platform.events.schedule(ms, std::move(act)); }
    void run(double ms) { platform.events.runFor(ms); }
    /// An instrument that answers at this speed.
    void identity() {
        line.expect("\r\n").answer("0\r");
        line.expect("GET\r").answer("0\r");
        line.expect("IDN?\r").answer(kIdentity);
    }
    void noise() { line.expect("\r\n").answer(kNoise); }
    void load() {
        form.load();
        form.COMList.setText("COM3");
    }
    /// Bridging at 57600 with no search.
    void bridge() {
        load();
        form.chkBaudRate.setValue(false);
        form.BaudList.setListIndex(3);
        form.cmdConnect.Click();
        ASSERT_TRUE(program.server().bridging());
    }
    void enter(const std::string& from = "127.0.0.1") {
        server.knock(++requests_, from);
        run(1);
    }
    std::string sentToClient() const { return client.written(); }

  private:
    int requests_ = 0;
};

struct Server : ServerBench, ::testing::Test {};

}  // namespace zel
