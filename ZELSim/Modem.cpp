#include "ZELSim/Modem.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <utility>

#include "ZELSim/HostLine.h"
#include "ZELSim/Numbers.h"
#include "ZELSim/Phonebook.h"

namespace zelsim {
namespace {

constexpr char kCr = '\r';
constexpr std::size_t kLongestCommand = 256;
constexpr double kGuard = 1.0;        // s of silence before "+++" and after it
constexpr double kGuardSlack = 0.02;  // s, what a host's clock may be early
constexpr double kAnswering = 0.005;  // s that an answer to a command takes
constexpr int kOk = 0;
constexpr int kError = 4;

struct ResultWord {
    CallResult result;
    const char* word;
    int code;
};
constexpr std::array<ResultWord, 4> kFailures{{{CallResult::NoCarrier, "NO CARRIER", 3},
                                               {CallResult::NoDialtone, "NO DIALTONE", 6},
                                               {CallResult::Busy, "BUSY", 7},
                                               {CallResult::NoAnswer, "NO ANSWER", 8}}};

int digit(const std::string& line, std::size_t& at) {
    int value = 0;
    for (; at < line.size() && line[at] >= '0' && line[at] <= '9'; ++at) {
        value = std::min(value * 10 + (line[at] - '0'), 999);
    }
    return value;
}

}  // namespace

Modem::Modem(HostLine& instrument, Phonebook book)
    : instrument_(instrument), book_(std::move(book)) {}

void Modem::receive(std::string_view bytes) {
    if (state_ == State::Online) {
        watchEscape(bytes);
        instrument_.setHostBaud(0);
        instrument_.receive(bytes);
        return;
    }
    for (const char c : bytes) {
        command(c);
        if (state_ == State::Online) {
            return;
        }
    }
}

void Modem::command(char c) {
    if (state_ == State::Dialling) {
        // Any character ends a dial. It may begin the next command, so it is not thrown away.
        pieces_.clear();
        hangUp();
        say("NO CARRIER", 3);
    }
    if (echo_) {
        pieces_.push_back({now_, std::string(1, c)});
    }
    if (c == '\n') {
        return;
    }
    if (c != kCr) {
        if (line_.size() < kLongestCommand) {
            line_.push_back(c);
        }
        return;
    }
    obey(std::exchange(line_, {}));
}

void Modem::obey(const std::string& text) {
    std::string line;
    for (const char c : upperCase(text)) {
        if (c != ' ' && c != '\t') {
            line.push_back(c);
        }
    }
    const auto begin = line.find("AT");
    if (begin == std::string::npos) {
        return;  // noise, or a bare line end
    }
    spoken_ = false;
    for (std::size_t at = begin + 2; at < line.size();) {
        if (!obeyOne(line, at)) {
            return say("ERROR", kError, kAnswering);
        }
    }
    if (!spoken_) {
        say("OK", kOk, kAnswering);
    }
}

bool Modem::obeyOne(const std::string& line, std::size_t& at) {
    const char letter = line[at++];
    switch (letter) {
        case 'D':
            if (at < line.size() && (line[at] == 'T' || line[at] == 'P')) {
                ++at;
            }
            dial(line.substr(at));
            at = line.size();
            return true;
        case '+':
        case 'S':  // registers and the words of mobile phones take the rest of the line
            at = line.size();
            return true;
        case '&':
            if (at == line.size()) {
                return false;
            }
            if (line[at++] == 'F') {
                echo_ = words_ = true;
                quiet_ = false;
                level_ = 4;
            }
            digit(line, at);
            return true;
        default:
            break;
    }
    const int value = digit(line, at);
    switch (letter) {
        case 'E':
            echo_ = value != 0;
            return value <= 1;
        case 'Q':
            quiet_ = value != 0;
            return value <= 1;
        case 'V':
            words_ = value != 0;
            return value <= 1;
        case 'X':
            level_ = value;
            return value <= 4;
        case 'H':
            hangUp();
            return true;
        case 'O':
            spoken_ = true;
            if (called_) {
                state_ = State::Online;
                lastByte_ = now_;
                say("CONNECT " + std::to_string(speed_), 1, kAnswering);
            } else {
                say("NO CARRIER", 3, kAnswering);
            }
            return true;
        case 'Z':
            hangUp();
            echo_ = words_ = true;
            quiet_ = false;
            return true;
        default:
            return std::string_view("ILMNTPBCK").find(letter) != std::string_view::npos;
    }
}

void Modem::dial(const std::string& number) {
    spoken_ = true;
    hangUp();
    const PhoneEntry entry = book_.find(number);
    state_ = State::Dialling;
    if (entry.result == CallResult::Silence) {
        return;
    }
    std::string word;
    int code = 1;
    if (entry.result == CallResult::Connect) {
        speed_ = entry.speed;
        word = level_ == 0 ? std::string("CONNECT") : "CONNECT " + std::to_string(entry.speed);
    } else {
        const auto* row =
            std::find_if(kFailures.begin(), kFailures.end(),
                         [&](const ResultWord& known) { return known.result == entry.result; });
        // The lowest level knows no tones of the line.
        const bool toneless = level_ == 0;
        word = toneless ? "NO CARRIER" : row->word;
        code = toneless ? 3 : row->code;
    }
    std::string answer =
        words_ ? "\r\n" + word + "\r\n" : std::to_string(code) + std::string(1, kCr);
    if (quiet_) {
        answer.clear();
    }
    const std::size_t size =
        entry.chunk == 0 ? std::max<std::size_t>(answer.size(), 1) : entry.chunk;
    double due = now_ + entry.after;
    for (std::size_t from = 0; from < answer.size(); from += size, due += entry.gap) {
        pieces_.push_back({due, answer.substr(from, size)});
    }
    if (entry.result == CallResult::Connect) {
        pieces_.push_back({due, "", true});
    } else {
        pieces_.push_back({due, ""});
    }
}

void Modem::say(const std::string& word, int code, double after) {
    spoken_ = true;
    if (quiet_) {
        return;
    }
    pieces_.push_back({now_ + after, words_ ? "\r\n" + word + "\r\n"
                                            : std::to_string(code) + std::string(1, kCr)});
}

void Modem::hangUp() {
    if (called_) {
        instrument_.reset();
    }
    called_ = false;
    state_ = State::Command;
}

void Modem::watchEscape(std::string_view bytes) {
    const bool quietBefore = now_ - lastByte_ >= kGuard - kGuardSlack;
    const bool only = bytes.find_first_not_of('+') == std::string_view::npos;
    if (only && (quietBefore || pluses_ > 0)) {
        pluses_ += bytes.size();
    } else {
        pluses_ = 0;
    }
    lastByte_ = now_;
}

void Modem::escapeIfDue() {
    if (state_ != State::Online || pluses_ != 3 || now_ - lastByte_ < kGuard - kGuardSlack) {
        return;
    }
    pluses_ = 0;
    state_ = State::Command;
    line_.clear();
    say("OK", kOk);
}

void Modem::advance(double seconds) {
    now_ += seconds;
    instrument_.advance(seconds);
    escapeIfDue();
}

std::string Modem::take() {
    std::string out;
    while (!pieces_.empty() && pieces_.front().due <= now_ + 1e-9) {
        const Piece piece = std::move(pieces_.front());
        pieces_.pop_front();
        out += piece.bytes;
        if (piece.connects) {
            called_ = true;
            state_ = State::Online;
            lastByte_ = now_;
            pluses_ = 0;
        } else if (pieces_.empty() && state_ == State::Dialling) {
            state_ = State::Command;
        }
    }
    std::string answer = instrument_.take();
    if (state_ == State::Online) {
        out += answer;
    }
    return out;
}

std::optional<double> Modem::nextDue() const {
    std::optional<double> due = instrument_.nextDue();
    const auto consider = [&](double at) {
        const double seconds = std::max(0.0, at - now_);
        due = due ? std::min(*due, seconds) : seconds;
    };
    if (!pieces_.empty()) {
        consider(pieces_.front().due);
    }
    if (state_ == State::Online && pluses_ == 3) {
        consider(lastByte_ + kGuard);
    }
    return due;
}

void Modem::reset() {
    hangUp();
    pieces_.clear();
    line_.clear();
    pluses_ = 0;
    instrument_.reset();
}

}  // namespace zelsim
