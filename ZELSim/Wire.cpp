#include "ZELSim/Wire.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <utility>

#include "ZELSim/Device.h"
#include "ZELSim/Numbers.h"
#include "ZELSim/Settings.h"
#include "ZELSim/Words.h"

namespace zelsim {
namespace {

constexpr char kCr = '\r';
constexpr char kLf = '\n';
constexpr std::size_t kLongestLine = 256;
constexpr std::size_t kMostLines = 64;
constexpr std::size_t kMostSegments = 64;
// Bytes of a long answer come in groups of this size, as out of a receiver's buffer.
constexpr std::size_t kGroup = 16;
constexpr double kSlack = 1e-7;  // s

constexpr std::array<std::pair<std::string_view, Verb>, 3> kVerbs{
    {{"CMD", Verb::Cmd}, {"SET", Verb::Set}, {"GET", Verb::Get}}};

std::string statusLine(int status) { return std::to_string(status) + kCr; }

}  // namespace

Wire::Wire(Device& device, const WireSetup& setup)
    : device_(device),
      baud_(setup.baud > 0 ? setup.baud : baudOfCode(static_cast<int>(device.settings().baud))),
      paced_(setup.baud > 0),
      strict_(setup.baud > 0 || setup.strictBaud),
      answering_(std::max(setup.answering, 0.0)),
      whole_(setup.wholeAnswers),
      faults_(setup.faults, device.seed()) {}

void Wire::receive(std::string_view bytes) {
    if (strict_ && hostBaud_ > 0 && hostBaud_ != baud_) {
        noise(bytes);
        return;
    }
    receiving_ = std::max(receiving_, now());
    for (const char c : bytes) {
        receiving_ += byteTime();
        if (c == kLf) {
            continue;
        }
        if (c != kCr) {
            partial_.tooLong = partial_.tooLong || partial_.text.size() >= kLongestLine;
            if (!partial_.tooLong) {
                partial_.text.push_back(c);
            }
            continue;
        }
        partial_.arrival = receiving_;
        if (lines_.size() < kMostLines) {
            lines_.push_back(std::move(partial_));
        }
        partial_ = Line{};
        run(now());
    }
}

void Wire::noise(std::string_view received) {
    const auto lines = std::count(received.begin(), received.end(), kCr);
    if (lines > 0 && segments_.size() < kMostSegments) {
        send("\xF8\x9C", 0);
    }
}

void Wire::advance(double seconds) { run(now() + seconds); }

// One thing that happens by `target`: a line that has arrived, or the end of a sweep that is
// waited for. False when there is none.
bool Wire::step(double target) {
    if (waiting_) {
        if (device_.sweepsFinished() >= awaitedSweep_ || !device_.sweeping()) {
            waiting_ = false;
            if (!waitVerdict_.silent) {
                send(statusLine(kAccepted), waitVerdict_.delay);
            }
            return true;
        }
        const auto next = device_.nextEvent();
        if (breaksWait(std::min(target, next ? now() + *next : target))) {
            waiting_ = false;  // the line itself is answered then
            return true;
        }
        if (!next || now() + *next > target + kSlack) {
            return false;
        }
        device_.advance(*next);
        return true;
    }
    if (lines_.empty() || lines_.front().arrival > target + kSlack ||
        segments_.size() >= kMostSegments) {
        return false;
    }
    const Line line = std::move(lines_.front());
    lines_.pop_front();
    if (line.arrival > now()) {
        device_.advance(line.arrival - now());
    }
    handle(line);
    return true;
}

// A bare line end ends a wait for a sweep: the host has given it up.
bool Wire::breaksWait(double before) const {
    return !lines_.empty() && !lines_.front().tooLong && lines_.front().text.empty() &&
           lines_.front().arrival <= before + kSlack;
}

void Wire::run(double target) {
    while (step(target)) {
    }
    if (target > now()) {
        device_.advance(target - now());
    }
}

void Wire::handle(const Line& line) {
    if (line.tooLong) {
        verb_.reset();
        send(statusLine(kSyntax), 0);
    } else if (verb_) {
        secondLine(line.text);
    } else {
        firstLine(line.text);
    }
}

void Wire::firstLine(const std::string& text) {
    const FaultPlan::Verdict verdict = faults_.beginExchange();
    const std::string word = upperCase(trimmed(text));
    const auto* row = std::find_if(kVerbs.begin(), kVerbs.end(),
                                   [&](const auto& entry) { return entry.first == word; });
    const bool known = row != kVerbs.end();
    int status = known || word.empty() ? kAccepted : kSyntax;
    if (verdict.refusal) {
        status = *verdict.refusal;
    } else if (known) {
        verb_ = row->second;
    }
    if (!verdict.silent) {
        send(statusLine(status), verdict.delay);
    }
}

void Wire::secondLine(const std::string& text) {
    const Verb verb = *verb_;
    verb_.reset();
    const auto end = text.find_first_of(",? ");
    const FaultPlan::Verdict verdict = faults_.secondLine(text.substr(0, end));
    if (verdict.refusal) {
        if (!verdict.silent) {
            send(statusLine(*verdict.refusal), verdict.delay);
        }
        return;
    }
    const Answer answer = execute(device_, verb, text);
    if (answer.waitsForSweep) {
        waiting_ = true;
        awaitedSweep_ = device_.sweepsFinished() + 1;
        waitVerdict_ = verdict;
        return;
    }
    std::string bytes = statusLine(answer.status);
    if (answer.hasValue) {
        bytes += answer.value;
        if (!answer.binary) {
            bytes += kCr;
        }
    }
    if (!verdict.silent) {
        send(std::move(bytes), verdict.delay);
    }
    // The answer still goes out at the old rate.
    if (verb == Verb::Set && answer.status == kAccepted &&
        upperCase(text.substr(0, end)) == "BAUD") {
        baud_ = baudOfCode(static_cast<int>(device_.settings().baud));
    }
}

void Wire::send(std::string bytes, double delay) {
    faults_.mangle(bytes);
    if (bytes.empty()) {
        return;
    }
    Segment segment;
    segment.start = std::max(now() + answering_ + delay, sending_);
    segment.perByte = byteTime();
    sending_ = segment.start + static_cast<double>(bytes.size()) * segment.perByte;
    segment.bytes = std::move(bytes);
    segments_.push_back(std::move(segment));
}

std::size_t Wire::arrived(const Segment& segment) const {
    const double passed = now() + kSlack - segment.start;
    if (passed < 0) {
        return 0;
    }
    const std::size_t size = segment.bytes.size();
    if (segment.perByte == 0) {
        return size;
    }
    const double bytes = std::floor(passed / segment.perByte);
    if (bytes >= static_cast<double>(size)) {
        return size;
    }
    return whole_ ? 0 : static_cast<std::size_t>(bytes) / kGroup * kGroup;
}

std::string Wire::take() {
    std::string out;
    while (!segments_.empty()) {
        Segment& segment = segments_.front();
        const std::size_t here = arrived(segment);
        if (here < segment.bytes.size()) {
            out.append(segment.bytes, segment.taken, here - segment.taken);
            segment.taken = here;
            break;
        }
        if (segment.taken == 0 && out.empty()) {
            out = std::move(segment.bytes);
        } else {
            out.append(segment.bytes, segment.taken);
        }
        segments_.pop_front();
    }
    if (!lines_.empty()) {
        run(now());  // there is room for answers again
    }
    return out;
}

std::optional<double> Wire::nextDue() const {
    std::optional<double> due;
    const auto consider = [&](double seconds) {
        due = std::max(0.0, due ? std::min(*due, seconds) : seconds);
    };
    if (!segments_.empty()) {
        const Segment& segment = segments_.front();
        const std::size_t size = segment.bytes.size();
        const std::size_t next =
            whole_ || segment.perByte == 0 ? size : std::min(size, segment.taken + kGroup);
        consider(segment.start + static_cast<double>(next) * segment.perByte - now());
    }
    if (waiting_) {
        if (const auto event = device_.nextEvent()) {
            consider(*event);
        }
        if (breaksWait(receiving_)) {
            consider(lines_.front().arrival - now());
        }
    } else if (!lines_.empty() && segments_.size() < kMostSegments) {
        consider(lines_.front().arrival - now());
    }
    return due;
}

void Wire::reset() {
    partial_ = Line{};
    lines_.clear();
    segments_.clear();
    verb_.reset();
    waiting_ = false;
    receiving_ = sending_ = now();
}

bool Wire::congested() const {
    return lines_.size() >= kMostLines / 2 || segments_.size() >= kMostSegments / 2;
}

}  // namespace zelsim
