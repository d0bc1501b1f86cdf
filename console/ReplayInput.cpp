#include "console/ReplayInput.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <string_view>
#include <utility>

#include "console/ConsoleDialogs.h"
#include "console/LineInput.h"
#include "platform/Clock.h"
#include "platform/Events.h"
#include "support/SessionCompare.h"
#include "support/SessionText.h"
#include "support/Text.h"

namespace zel {
namespace {

using Kind = SessionEvent::Kind;

constexpr std::int64_t kPatience = 60'000'000;  // microseconds that a line waits for bytes
constexpr std::string_view kAnswer = "answer ";
constexpr int kLookMs = 5;
constexpr std::int64_t kDrawing = 250'000;  // that a window may have drawn before a line

}  // namespace

ReplayInput::ReplayInput(const SessionRecord& record, const ReplayProgress& progress,
                         const Clock& clock, Events& events,
                         std::function<void(std::int64_t)> passTo)
    : progress_(progress),
      clock_(clock),
      events_(events),
      passTo_(std::move(passTo)),
      origin_(clock.micros()) {
    std::size_t came = 0;
    for (std::size_t i = 0; i < record.events.size(); ++i) {
        const SessionEvent& event = record.events[i];
        end_ = std::max(end_, event.micros);
        if (event.kind == Kind::Came) came += event.text.size();
        if (event.kind == Kind::Click)
            items_.push_back({i, event.micros, came, "click " + event.text});
        if (event.kind != Kind::Input) continue;
        items_.push_back({i, event.micros, came, event.text});
    }
}

ReplayInput::~ReplayInput() {
    if (task_ != 0) events_.cancel(task_);
}

bool ReplayInput::due(const Item& item) {
    const SessionCompare& compare = progress_.compare;
    std::int64_t now = clock_.micros() - origin_;
    const bool next = compare.place() > item.event && progress_.came >= item.came;
    if (next && now < item.micros && item.micros <= now + kDrawing && passTo_) {
        passTo_(origin_ + item.micros);
        now = item.micros;
    }
    if (now < item.micros) {
        // The loop looks again at that very moment.
        if (task_ != 0) events_.cancel(task_);
        task_ =
            events_.schedule(static_cast<double>(item.micros - now) / 1000, [this] { task_ = 0; });
        return false;
    }
    return compare.place() > item.event || compare.difference() || now > item.micros + kPatience;
}

LineInput::Got ReplayInput::next(std::string& line, bool /*block*/) {
    if (at_ == items_.size()) {
        const SessionCompare& compare = progress_.compare;
        const bool over = compare.complete() || compare.difference() ||
                          clock_.micros() - origin_ > end_ + kPatience;
        if (!over) return Got::Nothing;
        if (const auto cut = std::exchange(cutShort, nullptr)) cut();
        return Got::End;
    }
    if (!due(items_[at_])) return Got::Nothing;
    line = items_[at_++].line;
    return Got::Line;
}

void ReplayInput::awaitAnswer(AnswerQueue& answers) {
    while (answers.empty() && at_ < items_.size() && startsWith(items_[at_].line, kAnswer)) {
        if (due(items_[at_])) {
            answers.add(items_[at_++].line.substr(kAnswer.size()));
        } else {
            events_.wait(kLookMs);
        }
    }
}

}  // namespace zel
