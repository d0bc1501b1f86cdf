#include "server/Relay.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <utility>

#include "forms/ServerForm.h"
#include "link/TCPIPOps.h"
#include "platform/SerialPort.h"
#include "platform/Session.h"
#include "platform/Socket.h"
#include "support/RootDebug.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr const char* kComponent = "ServerForm";
constexpr const char* kClass = "Relay";
constexpr int kDataReceived = 2;
constexpr std::string_view kTraceWord = "TRACEBIN";
constexpr std::size_t kPiece = 4096;  // handed to the port at a time
constexpr int kFeedMs = 5;

}  // namespace

bool TraceWatch::take(const std::string& bytes) {
    const std::string seen = tail_ + upperCase(bytes);
    // The line end of the word itself may come in a segment of its own.
    const bool lineEnd = bytes.find_first_not_of("\r\n") == std::string::npos;
    trace_ = seen.find(kTraceWord) != std::string::npos || (trace_ && lineEnd);
    const std::size_t kept = std::min(seen.size(), kTraceWord.size() - 1);
    tail_ = seen.substr(seen.size() - kept);
    return trace_;
}

void TraceWatch::reset() {
    tail_.clear();
    trace_ = false;
}

Relay::Relay(ServerForm& form, SerialPort& SystemCommPort, Socket& client, const Session& services,
             RootDebug& log)
    : form_(form), port_(SystemCommPort), client_(client), services_(services), log_(log) {
    handlers_.on(client_.DataArrival, [this] { dataFromClient(); });
    handlers_.on(port_.OnComm, [this](int event) { dataFromInstrument(event); });
}

Relay::~Relay() {
    services_.events.cancel(groupTask_);
    services_.events.cancel(feedTask_);
}

void Relay::setQuiet(int ms) { quietMs_ = std::clamp(ms, 0, kLongestGroupMs); }

void Relay::restart() {
    const CallScope call(log_, kComponent, kClass, "restart");
    services_.events.cancel(groupTask_);
    services_.events.cancel(feedTask_);
    groupTask_ = feedTask_ = 0;
    forLine_.clear();
    group_.clear();
    watch_.reset();
    replies_.reset();
    form_.doBinaryData = false;
}

void Relay::dataFromClient() {
    const CallScope call(log_, kComponent, kClass, "dataFromClient");
    if (form_.ServerConnecting || !port_.isOpen()) {
        client_.getData();  // the line is not the client's yet
        return;
    }
    if (forLine_.size() >= kMostForLine) return feedLine();
    std::string text;
    TakeSocketData(text, client_);
    if (!text.empty()) RelayToInstrument(text);
}

void Relay::RelayToInstrument(const std::string& text) {
    const CallScope call(log_, kComponent, kClass, "RelayToInstrument");
    const bool before = form_.doBinaryData;
    form_.doBinaryData = watch_.take(text);
    if (form_.doBinaryData && !before) ++sweeps_;
    replies_.asked(text);
    toInstrument_ += text.size();
    forLine_ += text;
    feedLine();
}

// The port gets no more than it takes, so that what waits can still be dropped.
void Relay::feedLine() {
    const CallScope call(log_, kComponent, kClass, "feedLine");
    services_.events.cancel(feedTask_);
    feedTask_ = 0;
    std::size_t sent = 0;
    while (sent < forLine_.size() && port_.isOpen() && port_.bytesToWrite() == 0) {
        const std::size_t size = std::min(kPiece, forLine_.size() - sent);
        port_.output(std::string_view(forLine_).substr(sent, size));
        sent += size;
    }
    forLine_.erase(0, sent);
    if (!forLine_.empty()) {
        feedTask_ = services_.events.schedule(kFeedMs, [this] { feedLine(); });
    } else if (!client_.peekData().empty()) {
        feedTask_ = services_.events.schedule(0, [this] { dataFromClient(); });
    }
}

void Relay::dataFromInstrument(int commEvent) {
    const CallScope call(log_, kComponent, kClass, "dataFromInstrument");
    if (form_.ServerConnecting || commEvent != kDataReceived) return;
    std::string bytes = port_.input();
    // Nobody is there to get them.
    if (bytes.empty() || client_.state() != SocketState::Connected) return;
    const std::int64_t now = services_.clock.micros();
    if (group_.empty()) groupEnds_ = now + std::int64_t{kLongestGroupMs} * 1000;
    group_ += bytes;
    services_.events.cancel(groupTask_);
    groupTask_ = 0;
    if (form_.doBinaryData) return sendGroup();
    const bool whole = replies_.answered(bytes);
    const bool wholeTime = quietMs_ == kLongestGroupMs;
    if (whole && !wholeTime) return sendGroup();
    const double latest = static_cast<double>(groupEnds_ - now) / 1000;
    const double wait = wholeTime ? latest : std::min<double>(quietMs_, latest);
    if (wait <= 0) return sendGroup();
    groupTask_ = services_.events.schedule(wait, [this] { sendGroup(); });
}

void Relay::sendGroup() {
    const CallScope call(log_, kComponent, kClass, "sendGroup");
    groupTask_ = 0;
    replies_.quiet();
    sendToClient(std::exchange(group_, {}));
}

void Relay::sendToClient(const std::string& bytes) {
    const CallScope call(log_, kComponent, kClass, "sendToClient");
    if (client_.state() != SocketState::Connected) return;
    if (client_.bytesToWrite() + bytes.size() > kMostForClient) return ClientTooSlow();
    toClient_ += bytes.size();
    if (form_.doBinaryData) {
        SendSocketBytes(client_, bytes);
    } else {
        SendSocketText(client_, bytes);
    }
}

}  // namespace zel
