#include "support/SessionLog.h"

#include <algorithm>
#include <cstddef>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "platform/Clock.h"
#include "platform/Files.h"
#include "support/FileText.h"
#include "support/SessionText.h"
#include "support/Text.h"

namespace zel {
namespace {

using Kind = SessionEvent::Kind;

constexpr std::string_view kPin = "CPIN=";
constexpr std::size_t kTail = 64;
constexpr std::size_t kMostShown = 48;
constexpr const char* kEnd = "\n";

std::size_t bytesOf(const SessionEvent& event) { return sizeof event + event.text.size(); }

}  // namespace

std::string withoutPins(std::string_view before, std::string_view bytes) {
    std::string all = std::string(before) + std::string(bytes);
    const std::string upper = upperCase(all);
    for (auto at = upper.find(kPin); at != std::string::npos; at = upper.find(kPin, at + 1))
        for (std::size_t i = at + kPin.size(); i < all.size(); ++i) {
            if (all[i] == '"') continue;
            if (!isDigit(all[i])) break;
            all[i] = '*';
        }
    return all.substr(before.size());
}

SessionLog::SessionLog(const Clock& clock, FileService& files)
    : clock_(clock), files_(files), began_(clock.micros()) {}

std::string SessionLog::begin(const std::string& path, const std::string& startArguments) {
    end();
    std::string text = sessionLine({0, Kind::Start, startArguments}) + kEnd;
    if (whole_)
        for (const SessionEvent& event : events_) text += sessionLine(event) + kEnd;
    if (const FileProblem why = files_.replace(path, text); !why.empty())
        return writeProblem(path, why);
    written_ = text.size();
    path_ = path;
    if (whole_ && !events_.empty()) return {};
    began_ = clock_.micros();
    events_.clear();
    kept_ = 0;
    if (open_) note(Kind::Open, address_);
    return {};
}

void SessionLog::end() {
    if (!writing()) return;
    // The port stays as it is, so this is no event of the session.
    if (events_.empty() || events_.back().kind != Kind::Closed)
        write(sessionLine({clock_.micros() - began_, Kind::Closed, ""}) + kEnd);
    path_.clear();
}

void SessionLog::sent(std::string_view bytes) {
    if (bytes.empty()) return;
    note(Kind::Sent, withoutPins(sentTail_, bytes));
    sentTail_ += bytes;
    if (sentTail_.size() > kTail) sentTail_.erase(0, sentTail_.size() - kTail);
}

void SessionLog::came(std::string_view bytes) {
    if (!bytes.empty()) note(Kind::Came, std::string(bytes));
}

void SessionLog::opened(const std::string& address) {
    open_ = true;
    address_ = address;
    sentTail_.clear();
    note(Kind::Open, address);
}

void SessionLog::closed() {
    if (std::exchange(open_, false)) note(Kind::Closed, "");
}

void SessionLog::note(Kind kind, std::string text) {
    events_.push_back({clock_.micros() - began_, kind, std::move(text)});
    kept_ += bytesOf(events_.back());
    forget();
    Noted(events_.back());
    if (writing()) write(sessionLine(events_.back()) + kEnd);
}

void SessionLog::forget() {
    whole_ = whole_ && kept_ <= kMostKept;
    while (!whole_ && events_.size() > kKept) {
        kept_ -= bytesOf(events_.front());
        events_.pop_front();
    }
}

void SessionLog::write(const std::string& line) {
    FileProblem why;
    if (written_ + line.size() > kLongestSession) {
        why = "it has grown to " + sizeText(written_);
    } else {
        why = files_.append(path_, line);
    }
    written_ += line.size();
    if (why.empty()) return;
    const std::string path = std::exchange(path_, "");
    Failed(writeProblem(path, why));
}

std::vector<std::string> SessionLog::lastLines() const {
    std::vector<std::string> lines;
    const std::size_t shown = std::min(events_.size(), kKept);
    for (auto at = events_.end() - static_cast<std::ptrdiff_t>(shown); at != events_.end(); ++at) {
        SessionEvent event = *at;
        // A trace has thousands of bytes; a report is read by people.
        std::string rest;
        const bool bytes = event.kind == Kind::Sent || event.kind == Kind::Came;
        if (bytes && event.text.size() > kMostShown) {
            rest = " ... " + std::to_string(event.text.size()) + " bytes";
            event.text.resize(kMostShown);
        }
        lines.push_back(sessionLine(event) + rest);
    }
    return lines;
}

}  // namespace zel
