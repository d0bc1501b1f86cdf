#include "platform/virtual/Dialogue.h"

#include <algorithm>
#include <cstddef>
#include <functional>
#include <memory>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "platform/ByteText.h"
#include "platform/Events.h"
#include "platform/virtual/LineFaults.h"

namespace zel {

std::string hexAndText(std::string_view bytes) {
    if (bytes.empty()) return "nothing";
    std::string hex;
    std::string text;
    for (const char byte : bytes) {
        const std::string code = hexOf(byte);
        hex += hex.empty() ? "" : " ";
        hex += code;
        if (byte == '\r') {
            text += "\\r";
        } else if (byte == '\n') {
            text += "\\n";
        } else if (byte < ' ' || byte > '~') {
            text += "\\x" + code;
        } else {
            text += byte;
        }
    }
    return hex + " (\"" + text + "\")";
}

Dialogue::~Dialogue() { closed(); }

Dialogue& Dialogue::expect(std::string bytes) {
    Step step;
    step.request = std::move(bytes);
    steps_.push_back(std::move(step));
    return *this;
}

Dialogue& Dialogue::answer(std::string bytes) {
    Step& step = lastStep();
    step.lastAnswer = step.pieces.size();
    step.pieces.push_back({std::move(bytes), 0, false});
    return *this;
}

Dialogue& Dialogue::after(int ms) {
    Step& step = lastStep();
    if (!step.pieces.empty()) step.pieces[step.lastAnswer].delayMs = ms;
    return *this;
}

Dialogue& Dialogue::chunks(std::initializer_list<std::size_t> lengths, int gapMs) {
    Step& step = lastStep();
    if (step.pieces.empty()) return *this;
    const Piece whole = step.pieces.back();
    step.pieces.pop_back();
    std::size_t at = 0;
    const auto add = [&](std::size_t length) {
        const int delay = at == 0 ? whole.delayMs : gapMs;
        step.pieces.push_back({whole.bytes.substr(at, length), delay, false});
        at += length;
    };
    for (const std::size_t length : lengths)
        if (at < whole.bytes.size() && length > 0) add(length);
    if (at < whole.bytes.size()) add(whole.bytes.size() - at);
    return *this;
}

Dialogue& Dialogue::repeat(int times) {
    if (steps_.empty()) return *this;
    const Step step = steps_.back();
    for (int i = 0; i < times; ++i) steps_.push_back(step);
    return *this;
}

Dialogue& Dialogue::dies() {
    lastStep().pieces.push_back({"", 0, true});
    return *this;
}

void Dialogue::opened() {
    if (current_ == 0 && written_.empty()) play(opening_);
}

void Dialogue::sent(std::string_view bytes) {
    const std::size_t limit = std::size_t{1} << 24;
    written_.append(bytes.substr(0, limit - std::min(limit, written_.size())));
    if (!steps_.empty() && failure_.empty()) check(bytes);
}

void Dialogue::check(std::string_view bytes) {
    for (std::size_t i = 0; i < bytes.size(); ++i) {
        const bool known = current_ < steps_.size();
        if (!known || steps_[current_].request[partly_.size()] != bytes[i]) {
            fail(bytes.substr(i));
            return;
        }
        partly_ += bytes[i];
        if (partly_.size() < steps_[current_].request.size()) continue;
        partly_.clear();
        play(steps_[current_++]);
    }
}

void Dialogue::fail(std::string_view got) {
    failure_ = "step " + std::to_string(current_ + 1) + ": expected ";
    failure_ += current_ < steps_.size() ? hexAndText(steps_[current_].request) : "nothing";
    failure_ += ", got " + hexAndText(partly_ + std::string(got));
    failure_ += ", differing at byte " + std::to_string(partly_.size() + 1);
}

void Dialogue::closed() {
    for (const TaskId id : underWay_) events_.cancel(id);
    underWay_.clear();
    waiting_.clear();
    held_ = false;
}

std::string Dialogue::leftOver() const {
    std::string text;
    for (std::size_t i = current_; i < steps_.size(); ++i) {
        if (!text.empty()) text += "\n";
        text += "step " + std::to_string(i + 1) + " of " + std::to_string(steps_.size());
        text += " not played: " + hexAndText(steps_[i].request);
        if (i == current_ && !partly_.empty()) text += ", sent so far " + hexAndText(partly_);
    }
    return text;
}

Dialogue::Step& Dialogue::lastStep() { return steps_.empty() ? opening_ : steps_.back(); }

void Dialogue::play(const Step& step) {
    double ms = 0;
    for (const Piece& piece : step.pieces) {
        ms += piece.delayMs;
        later(ms, [this, piece] { arrive(piece); });
    }
}

void Dialogue::arrive(const Piece& piece) {
    if (held_) {
        waiting_.push_back(piece);
        return;
    }
    const FaultyRun run = applyFaults(faults, delivered_, piece.bytes);
    const bool dies = piece.dies || run.dies;
    for (const FaultyRun::Piece& part : run.pieces) {
        if (part.pauseMs > 0) {
            held_ = true;
            later(part.pauseMs, [this, rest = part.bytes, dies] { release(rest, dies); });
            return;
        }
        hand(part.bytes);
    }
    if (dies && died) died();
}

void Dialogue::release(const std::string& rest, bool dies) {
    hand(rest);
    held_ = false;
    std::vector<Piece> behind;
    behind.swap(waiting_);
    if (dies) {
        if (died) died();
        return;
    }
    for (const Piece& piece : behind) arrive(piece);
}

void Dialogue::hand(const std::string& bytes) {
    delivered_ += static_cast<long>(bytes.size());
    if (deliver && !bytes.empty()) deliver(bytes);
}

void Dialogue::later(double ms, std::function<void()> task) {
    const auto id = std::make_shared<TaskId>(0);
    *id = events_.schedule(ms, [this, id, task = std::move(task)] {
        underWay_.erase(*id);
        task();
    });
    underWay_.insert(*id);
}

}  // namespace zel
