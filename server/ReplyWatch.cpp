#include "server/ReplyWatch.h"

#include <string_view>

#include "support/Text.h"

namespace zel {
namespace {

constexpr char kCr = '\r';

bool isPlain(char c) { return c >= ' ' && c <= '~'; }

}  // namespace

void ReplyWatch::asked(std::string_view bytes) {
    for (const char c : bytes) {
        if (c == kCr) {
            lineAsked();
            line_.clear();
        } else if (isPlain(c) && line_.size() < kLongestLine) {
            line_ += c;
        } else {
            lose();
        }
    }
}

void ReplyWatch::lineAsked() {
    // A question before the answer to the last one: which answer is whose is not known.
    if (await_ != Await::Nothing) return lose();
    const std::string word = upperCase(line_);
    switch (mode_) {
        case Mode::None:
            if (word == "GET") {
                mode_ = Mode::Query;
            } else if (word == "SET" || word == "CMD") {
                mode_ = Mode::Change;
            } else {
                return lose();
            }
            await_ = Await::ModeStatus;
            return;
        case Mode::Change:
            await_ = Await::Status;
            break;
        case Mode::Query:
            await_ = Await::QueryStatus;
            break;
    }
    mode_ = Mode::None;
    // A line with no word in it breaks off; samples are no text.
    if (word.empty() || contains(word, "TRACEBIN")) lose();
}

bool ReplyWatch::answered(std::string_view bytes) {
    for (const char c : bytes) {
        if (await_ == Await::Nothing || !(c == kCr || isPlain(c)) ||
            reply_.size() >= kLongestReply) {
            lose();
        }
        if (await_ == Await::Unclear) return false;
        if (c == kCr) {
            lineAnswered();
            reply_.clear();
        } else {
            reply_ += c;
        }
    }
    return await_ == Await::Nothing;
}

void ReplyWatch::lineAnswered() {
    if (await_ == Await::Text) {
        await_ = Await::Nothing;
    } else if (reply_ != "0") {
        lose();
    } else {
        await_ = await_ == Await::QueryStatus ? Await::Text : Await::Nothing;
    }
}

void ReplyWatch::lose() {
    mode_ = Mode::None;
    await_ = Await::Unclear;
    reply_.clear();
}

void ReplyWatch::quiet() {
    if (await_ == Await::Unclear) await_ = Await::Nothing;
}

void ReplyWatch::reset() {
    mode_ = Mode::None;
    await_ = Await::Nothing;
    line_.clear();
    reply_.clear();
}

}  // namespace zel
