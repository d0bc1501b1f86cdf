#include "platform/virtual/ScriptedPort.h"

#include <string>
#include <string_view>
#include <utility>

#include "platform/Events.h"
#include "platform/SerialPort.h"

namespace zel {
namespace {

constexpr int kDataReceived = 2;

}  // namespace

ScriptedPort::ScriptedPort(Events& events) : script_(events) {
    script_.deliver = [this](const std::string& bytes) { arrive(bytes); };
    script_.died = [this] { die(); };
}

void ScriptedPort::splitAtByte(long position, int pauseMs) {
    script_.faults.splitAt = position;
    script_.faults.splitPauseMs = pauseMs;
}

void ScriptedPort::failOpen(std::string why, int times) {
    openFailure_ = std::move(why);
    openFailures_ = times;
}

void ScriptedPort::die() {
    if (!open_) return;
    open_ = false;
    problem_ = openings_.back().CommPort + " has gone.";
    script_.closed();
}

void ScriptedPort::arrive(const std::string& bytes) {
    if (!open_) return;
    waiting_ += bytes;
    OnComm(kDataReceived);
}

bool ScriptedPort::open(const SerialSetup& setup) {
    openings_.push_back(setup);
    if (openFailures_ > 0) {
        --openFailures_;
        problem_ = openFailure_;
        return false;
    }
    open_ = true;
    problem_.clear();
    waiting_.clear();
    script_.opened();
    return true;
}

void ScriptedPort::close() {
    if (!open_) return;
    open_ = false;
    waiting_.clear();
    script_.closed();
}

void ScriptedPort::output(std::string_view bytes) {
    if (open_) script_.sent(bytes);
}

}  // namespace zel
