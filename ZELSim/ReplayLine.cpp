#include "ZELSim/ReplayLine.h"

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include "support/SessionText.h"

namespace zelsim {
namespace {

constexpr double kMicros = 1e6;

}  // namespace

ReplayLine::ReplayLine(const zel::SessionRecord& record, bool paced)
    : record_(record), paced_(paced), compare_(record) {
    release();
}

// What the instrument said before the host's next bytes is on its way.
void ReplayLine::release() {
    for (; released_ < compare_.place(); ++released_) {
        const zel::SessionEvent& event = record_.events[released_];
        if (event.kind == zel::SessionEvent::Kind::Sent) {
            anchor_ = now_;
            recordedAnchor_ = event.micros;
        } else if (event.kind == zel::SessionEvent::Kind::Came) {
            const std::int64_t later = paced_ ? event.micros - recordedAnchor_ : 0;
            waiting_.push_back({anchor_ + later, event.text});
        }
    }
}

void ReplayLine::receive(std::string_view bytes) {
    for (const char byte : bytes) {
        if (compare_.difference()) {
            return;
        }
        if (compare_.sent(byte)) {
            release();
        } else if (differs) {
            differs(compare_.difference()->text);
        }
    }
}

void ReplayLine::advance(double seconds) { now_ += std::llround(std::max(seconds, 0.0) * kMicros); }

std::string ReplayLine::take() {
    std::string bytes;
    while (!waiting_.empty() && waiting_.front().due <= now_) {
        bytes += waiting_.front().bytes;
        waiting_.pop_front();
    }
    return bytes;
}

std::optional<double> ReplayLine::nextDue() const {
    if (waiting_.empty()) {
        return std::nullopt;
    }
    return static_cast<double>(std::max<std::int64_t>(waiting_.front().due - now_, 0)) / kMicros;
}

}  // namespace zelsim
