#pragma once
// Two copies of the program in one virtual time: the server at a simulated instrument, and a client
// that comes to it over a network which fails at a byte of the test's choice.

#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <utility>

#include "ZELSim/InProcessPort.h"
#include "link/CommandExchange.h"
#include "platform/virtual/FaultyPort.h"
#include "platform/virtual/VirtualPlatform.h"
#include "server/ServerBridge.h"
#include "server/ServerDialog.h"
#include "shell/Program.h"
#include "support/NumberText.h"
#include "tests/ShownBoxes.h"
#include "trace/TraceReader.h"

namespace zel {

/// A reset ends the connection, a half-open one carries nothing more and nobody hears of it, a
/// split is a pause that is shorter than any time-out.
enum class NetFault { None, Reset, HalfOpen, Split };

class PipeSocket;

/// What two ends share. Bytes arrive a moment after they were sent.
struct Pipe : std::enable_shared_from_this<Pipe> {
    explicit Pipe(Events& loop) : events(loop) {}
    struct Way {
        PipeSocket* to = nullptr;
        std::string queue;
        bool scheduled = false;
        NetFault fault = NetFault::None;
        long at = 0;      ///< bytes that still pass before the fault
        long passed = 0;  ///< since the fault was armed
    };
    static constexpr double kTravelMs = 0.3;
    static constexpr double kSplitMs = 40;

    void send(int way, std::string_view bytes) {
        if (dead) return;
        ways[way].queue += bytes;
        go(way, kTravelMs);
    }
    void go(int way, double ms) {
        if (ways[way].scheduled) return;
        ways[way].scheduled = true;
        events.schedule(ms, [self = shared_from_this(), way] {
            self->ways[way].scheduled = false;
            self->deliver(way);
        });
    }
    void deliver(int way);
    void end(PipeSocket* by);

    Events& events;
    Way ways[2];
    bool dead = false;
};

class PipeSocket : public Socket {
  public:
    explicit PipeSocket(Events& events) : events_(events) {}
    ~PipeSocket() override { close(); }
    PipeSocket(const PipeSocket&) = delete;
    PipeSocket& operator=(const PipeSocket&) = delete;

    /// Where a connection goes to.
    std::function<void(PipeSocket&)> knocks;
    void join(std::shared_ptr<Pipe> pipe, int way) {
        pipe_ = std::move(pipe);
        way_ = way;
        pipe_->ways[1 - way].to = this;
        state_ = SocketState::Connected;
        waiting_.clear();
    }
    void arrive(const std::string& bytes) {
        waiting_ += bytes;
        DataArrival();
    }
    void ended() {
        if (state_ != SocketState::Connected) return;
        state_ = SocketState::PeerClosing;
        PeerClosed();
    }
    std::shared_ptr<Pipe> pipe() const { return pipe_; }

    void connectTo(const std::string&, int) override {
        close();
        state_ = SocketState::Connecting;
        events_.schedule(1, [this] {
            if (state_ == SocketState::Connecting) knocks(*this);
        });
    }
    void connectTls(const std::string& host, int port, const std::string&) override {
        connectTo(host, port);
    }
    void close() override {
        state_ = SocketState::Closed;
        waiting_.clear();
        if (pipe_) std::exchange(pipe_, nullptr)->end(this);
    }
    void fail() { state_ = SocketState::Error; }
    SocketState state() const override { return state_; }
    bool sendData(std::string_view bytes) override {
        if (state_ != SocketState::Connected) return false;
        pipe_->send(way_, bytes);
        return true;
    }
    std::string peekData() override { return waiting_; }
    std::string getData() override { return std::exchange(waiting_, {}); }
    std::size_t bytesToWrite() const override { return pipe_ ? pipe_->ways[way_].queue.size() : 0; }
    std::string problem() const override { return {}; }

  private:
    Events& events_;
    std::shared_ptr<Pipe> pipe_;
    int way_ = 0;
    SocketState state_ = SocketState::Closed;
    std::string waiting_;
};

inline void Pipe::deliver(int way) {
    Way& w = ways[way];
    if (dead || w.to == nullptr || w.queue.empty()) return;
    std::string bytes = std::exchange(w.queue, {});
    const long here = w.fault == NetFault::None ? static_cast<long>(bytes.size()) : w.at - w.passed;
    if (here < static_cast<long>(bytes.size())) {
        w.queue = bytes.substr(static_cast<std::size_t>(here));
        bytes.resize(static_cast<std::size_t>(here));
    }
    w.passed += static_cast<long>(bytes.size());
    if (!bytes.empty()) w.to->arrive(bytes);
    if (w.queue.empty()) return;
    const NetFault fault = std::exchange(w.fault, NetFault::None);
    if (fault == NetFault::Split) return go(way, kSplitMs);
    dead = true;
    if (fault == NetFault::Reset)
        for (Way& each : ways)
            if (each.to != nullptr) each.to->ended();
}

inline void Pipe::end(PipeSocket* by) {
    for (Way& way : ways)
        if (way.to == by) way.to = nullptr;
    if (dead) return;
    // The other end gets what is on its way, and then hears of it.
    events.schedule(kTravelMs * 2, [self = shared_from_this()] {
        if (std::exchange(self->dead, true)) return;
        for (Way& way : self->ways)
            if (way.to != nullptr) way.to->ended();
    });
}

class PipeServer : public ServerSocket {
  public:
    explicit PipeServer(Events& events) : events_(events), client_(events) {}

    void knock(PipeSocket& socket) {
        if (state_ != SocketState::Listening) return socket.fail();
        waiting_ = &socket;
        ConnectionRequest(++request_);
        waiting_ = nullptr;
    }
    void listen(const std::string&, int port) override {
        port_ = port;
        state_ = SocketState::Listening;
    }
    void close() override { state_ = SocketState::Closed; }
    SocketState state() const override { return state_; }
    int port() const override { return port_; }
    std::string problem() const override { return {}; }
    std::string localIP() const override { return "127.0.0.1"; }
    std::string useTls(const TlsFiles&) override { return {}; }
    std::string peer(int) const override { return "127.0.0.1"; }
    void accept(int) override {
        client_.close();
        auto pipe = std::make_shared<Pipe>(events_);
        waiting_->join(pipe, 0);
        client_.join(pipe, 1);
    }
    void refuse(int) override { waiting_->fail(); }
    Socket& client() override { return client_; }
    PipeSocket& end() { return client_; }

  private:
    Events& events_;
    PipeSocket client_;
    PipeSocket* waiting_ = nullptr;
    SocketState state_ = SocketState::Closed;
    int port_ = 0;
    int request_ = 0;
};

struct NetworkSetup {
    static constexpr int kToServer = 0;
    static constexpr int kToClient = 1;

    VirtualPlatform desk;
    VirtualPlatform far;  ///< on the time of the desk
    PipeSocket socket{desk.events};
    PipeServer listener{desk.events};
    zelsim::InProcessPort instrument{desk.clock, desk.events};
    FaultyPort line{instrument, desk.events};
    Program server{farPlatform(), ""};
    Program client{deskPlatform(), ""};
    ServerForm& form = server.forms().server;
    ControllerForm& panel = client.forms().controller;

    NetworkSetup() {
        socket.knocks = [this](PipeSocket& who) { listener.knock(who); };
        server.start();
        client.start();
        server.serverDialog().fillFields();
        form.COMList.setText("COM1");
        form.chkBaudRate.setValue(false);
        form.BaudList.setText("57600");
        EXPECT_TRUE(server.server().connect());
    }

    bool connect() { return client.connect({LinkAddress::Kind::Tcp, "127.0.0.1", 2277}, false); }
    bool reconnect() {
        client.disconnect();
        return connect();
    }
    /// From now on that fault at that byte of that way.
    void arm(int way, NetFault fault, long byte) {
        Pipe::Way& w = socket.pipe()->ways[way];
        w.fault = fault;
        w.at = byte;
        w.passed = 0;
    }
    long passed(int way) { return socket.pipe()->ways[way].passed; }
    bool get(const std::string& word, std::string& value) {
        return client.exchange().GetInstrument(word, value);
    }
    bool readTrace() {
        bool success = false;
        client.traces().ReadSingleTrace2({}, success);
        return success;
    }
    bool asksRightCentre() {
        std::string value;
        return get("FREQ", value) && leadingNumber(value) == instrument.device().settings().centre;
    }
    void run(double ms) { desk.events.runFor(ms); }
    std::size_t waiting() { return server.server().relay().waiting(); }

  private:
    Platform deskPlatform() {
        return {desk.clock,     desk.events,     desk.boxes,        desk.port,     desk.ports,
                socket,         desk.serverPort, desk.serverSocket, desk.settings, desk.debug,
                desk.clipboard, desk.launcher,   desk.startup,      desk.folder,   desk.fileDialogs,
                desk.files,     desk.endSignals, desk.machine,      desk.portProbe};
    }
    Platform farPlatform() {
        return {desk.clock,    desk.events,    far.boxes,   far.port,     far.ports,
                far.tcpSocket, line,           listener,    far.settings, far.debug,
                far.clipboard, far.launcher,   far.startup, far.folder,   far.fileDialogs,
                far.files,     far.endSignals, far.machine, far.portProbe};
    }
};

}  // namespace zel
