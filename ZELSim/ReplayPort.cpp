#include "ZELSim/ReplayPort.h"

#include <cstddef>
#include <cstdint>
#include <functional>
#include <string_view>
#include <utility>

#include "platform/Clock.h"
#include "platform/Events.h"
#include "platform/SerialPort.h"
#include "platform/Socket.h"
#include "support/SessionText.h"

namespace zelsim {
namespace {

constexpr double kMicros = 1e6;
constexpr int kReceived = 2;  // CommEvent of arrived data
constexpr const char* kNotOpened = "The recorded session opened no connection here.";

}  // namespace

ReplaySource::ReplaySource(const zel::SessionRecord& record, const zel::Clock& clock,
                           zel::Events& events, std::function<void(std::int64_t)> moveTo)
    : record_(record),
      clock_(clock),
      events_(events),
      moveTo_(std::move(moveTo)),
      line_(record, true),
      origin_(clock.micros()),
      seen_(clock.micros()) {}

ReplaySource::~ReplaySource() {
    if (task_) {
        events_.cancel(*task_);
    }
}

bool ReplaySource::open() {
    // An opening counts when all that was sent before it has been sent.
    for (std::size_t i = opens_; i < record_.events.size() && i < compare().place(); ++i) {
        if (record_.events[i].kind != zel::SessionEvent::Kind::Open) {
            continue;
        }
        opens_ = i + 1;
        waiting_.clear();
        watch();
        return true;
    }
    return false;
}

void ReplaySource::close() {
    line_.reset();
    waiting_.clear();
}

void ReplaySource::send(std::string_view bytes) {
    if (!compare().complete()) {
        moveTo_(origin_ + record_.events[compare().place()].micros);
    }
    catchUp();
    line_.receive(bytes);
    watch();
}

std::string ReplaySource::take() {
    catchUp();
    return std::exchange(waiting_, {});
}

const std::string& ReplaySource::waiting() {
    catchUp();
    return waiting_;
}

void ReplaySource::catchUp() {
    const std::int64_t now = clock_.micros();
    line_.advance(static_cast<double>(now - seen_) / kMicros);
    seen_ = now;
    waiting_ += line_.take();
}

// Has the event loop come back when the next bytes are there.
void ReplaySource::watch() {
    if (task_) {
        events_.cancel(*task_);
        task_.reset();
    }
    const auto due = line_.nextDue();
    if (!due) {
        return;
    }
    const double ago = static_cast<double>(clock_.micros() - seen_) / kMicros;
    task_ = events_.schedule((*due - ago) * 1000, [this] {
        task_.reset();
        const std::size_t before = waiting_.size();
        catchUp();
        watch();
        if (waiting_.size() > before) {
            Arrived();
        }
    });
}

ReplayPort::ReplayPort(ReplaySource& source) : source_(source) {
    handlers_.on(source_.Arrived, [this] {
        if (open_) {
            OnComm(kReceived);
        }
    });
}

bool ReplayPort::open(const zel::SerialSetup& /*setup*/) {
    open_ = source_.open();
    problem_ = open_ ? "" : kNotOpened;
    return open_;
}

void ReplayPort::close() {
    if (std::exchange(open_, false)) {
        source_.close();
    }
}

void ReplayPort::output(std::string_view bytes) {
    if (open_) {
        source_.send(bytes);
    }
}

ReplaySocket::ReplaySocket(ReplaySource& source) : source_(source) {
    handlers_.on(source_.Arrived, [this] {
        if (connected()) {
            DataArrival();
        }
    });
}

void ReplaySocket::connectTo(const std::string& /*host*/, int /*port*/) {
    const bool open = source_.open();
    problem_ = open ? "" : kNotOpened;
    state_ = open ? zel::SocketState::Connected : zel::SocketState::Error;
}

void ReplaySocket::connectTls(const std::string& host, int port, const std::string& /*pinned*/) {
    connectTo(host, port);
}

void ReplaySocket::close() {
    if (connected()) {
        source_.close();
    }
    state_ = zel::SocketState::Closed;
}

bool ReplaySocket::sendData(std::string_view bytes) {
    if (!connected()) {
        return false;
    }
    source_.send(bytes);
    return true;
}

}  // namespace zelsim
