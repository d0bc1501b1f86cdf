#include "platform/virtual/FaultyPort.h"

#include <string_view>
#include <utility>

#include "platform/Events.h"
#include "platform/SerialPort.h"
#include "platform/virtual/LineFaults.h"

namespace zel {
namespace {

constexpr int kDataReceived = 2;

}  // namespace

FaultyPort::FaultyPort(SerialPort& inner, Events& events) : inner_(inner), events_(events) {
    inner_.OnComm.connect([this](int code) {
        if (!dead_) OnComm(code);
    });
}

FaultyPort::~FaultyPort() { events_.cancel(release_); }

void FaultyPort::arm(const LineFaults& faults) {
    faults_ = faults;
    received_ = 0;
}

bool FaultyPort::open(const SerialSetup& setup) {
    if (dead_) disarm();
    close();
    dead_ = false;
    return inner_.open(setup);
}

void FaultyPort::close() {
    events_.cancel(release_);
    held_ = diesBehind_ = false;
    waiting_.clear();
    behind_.clear();
    inner_.close();
}

std::string FaultyPort::input() {
    take();
    return std::exchange(waiting_, {});
}

void FaultyPort::output(std::string_view bytes) {
    if (isOpen()) inner_.output(bytes);
}

void FaultyPort::take() {
    if (!isOpen()) return;
    const std::string bytes = inner_.input();
    if (bytes.empty()) return;
    const FaultyRun run = applyFaults(faults_, received_, bytes);
    received_ += static_cast<long>(bytes.size());
    for (const FaultyRun::Piece& piece : run.pieces) {
        if (piece.pauseMs > 0) {
            held_ = true;
            release_ = events_.schedule(piece.pauseMs, [this] {
                held_ = false;
                waiting_ += std::exchange(behind_, {});
                if (diesBehind_) die();
                if (!waiting_.empty()) OnComm(kDataReceived);
            });
        }
        (held_ ? behind_ : waiting_) += piece.bytes;
    }
    if (!run.dies) return;
    if (held_) {
        diesBehind_ = true;
    } else {
        die();
    }
}

void FaultyPort::die() {
    dead_ = true;
    diesBehind_ = false;
    inner_.close();
}

}  // namespace zel
