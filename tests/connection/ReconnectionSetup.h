#pragma once
// A session over a port or over TCP whose other end goes and comes back.

#include <gtest/gtest.h>

#include <string>
#include <string_view>
#include <utility>

#include "ZELSim/InProcessPort.h"
#include "platform/virtual/VirtualPlatform.h"
#include "shell/Program.h"
#include "tests/ShownBoxes.h"
#include "tests/connection/SwitchedPort.h"

namespace zel {

/// A server with the simulated instrument, which can go and come back.
class ServedInstrument : public Socket {
  public:
    ServedInstrument(const Clock& clock, Events& events) : port_(clock, events) {}

    void goAway() {
        there_ = false;
        port_.close();
        if (state_ == SocketState::Connected) state_ = SocketState::PeerClosing;
    }
    void comeBack() { there_ = true; }
    /// The server is there, and its instrument is switched off.
    void switchInstrument(bool on) { answers_ = on; }
    int attempts() const { return attempts_; }
    const std::string& host() const { return host_; }

    void connectTo(const std::string& host, int) override {
        ++attempts_;
        host_ = host;
        state_ = there_ && port_.open({.CommPort = "tcp", .Settings = "57600,N,8,1"})
                     ? SocketState::Connected
                     : SocketState::Error;
    }
    void connectTls(const std::string& host, int port, const std::string&) override {
        connectTo(host, port);
    }
    void close() override {
        port_.close();
        waiting_.clear();
        state_ = SocketState::Closed;
    }
    SocketState state() const override { return state_; }
    bool sendData(std::string_view bytes) override {
        if (state_ != SocketState::Connected) return false;
        if (answers_) port_.output(bytes);
        return true;
    }
    std::string peekData() override {
        if (state_ == SocketState::Connected) waiting_ += port_.input();
        return waiting_;
    }
    std::string getData() override {
        peekData();
        return std::exchange(waiting_, {});
    }
    std::size_t bytesToWrite() const override { return 0; }
    std::string problem() const override { return there_ ? "" : "Connection refused."; }

  private:
    zelsim::InProcessPort port_;
    SocketState state_ = SocketState::Closed;
    bool there_ = true;
    bool answers_ = true;
    int attempts_ = 0;
    std::string waiting_;
    std::string host_;
};

struct ReconnectionSetup : ::testing::Test {
    static constexpr const char* kPath = "/dev/ttyUSB0";
    using Kind = LinkAddress::Kind;

    explicit ReconnectionSetup(Kind kind) : kind_(kind) {
        comeBack();
        program.start();
    }
    bool tcp() const { return kind_ == Kind::Tcp; }
    const char* name() const { return tcp() ? "host:2277" : kPath; }
    bool connect() {
        return program.connect(
            tcp() ? LinkAddress{Kind::Tcp, "host", 2277} : LinkAddress{Kind::Serial, kPath, 57600},
            true);
    }
    void goAway() {
        if (tcp()) return socket.goAway();
        platform.portProbe.rights.clear();
        port.close();
    }
    void comeBack() {
        if (tcp()) return socket.comeBack();
        platform.portProbe.rights[kPath] = {
            .exists = true, .terminal = true, .usable = true, .group = {}};
    }
    /// The line is there, and the instrument is switched off.
    void switchInstrument(bool on) {
        port.on = on;
        socket.switchInstrument(on);
    }
    void pass(int ms) { platform.events.runFor(ms); }
    std::string bar() const {
        return panel.ReconnectFrame.Visible ? panel.ReconnectLabel.Caption.get() : "";
    }
    std::string again() const {
        return std::string("Connected to ") + name() + " again. All settings are as before.";
    }
    Texts shown() const { return shownBoxes(platform.boxes); }
    Platform bundle() {
        return {platform.clock,      platform.events,  platform.boxes,       port,
                platform.ports,      socket,           platform.serverPort,  platform.serverSocket,
                platform.settings,   platform.debug,   platform.clipboard,   platform.launcher,
                platform.startup,    platform.folder,  platform.fileDialogs, platform.files,
                platform.endSignals, platform.machine, platform.portProbe};
    }

    VirtualPlatform platform;
    SwitchedPort port{platform.clock, platform.events};
    ServedInstrument socket{platform.clock, platform.events};
    Program program{bundle(), ""};
    ControllerForm& panel = program.forms().controller;

  private:
    Kind kind_;
};

}  // namespace zel
