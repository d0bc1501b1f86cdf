#include "support/SessionLog.h"

#include <utility>

#include "support/FileText.h"
#include "support/Text.h"

namespace zel {
namespace {

using Kind = SessionEvent::Kind;

constexpr std::string_view kPin = "CPIN=";
constexpr std::size_t kTail = 64;
constexpr std::size_t kMostShown = 48;
constexpr const char* kEnd = "\n";

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

std::string SessionLog::begin(const std::string& path, const std::string& arguments) {
    end();
    const SessionEvent start{0, Kind::Start, arguments};
    const std::string line = sessionLine(start) + kEnd;
    if (const FileProblem why = files_.replace(path, line); !why.empty())
        return writeProblem(path, why);
    began_ = clock_.micros();
    written_ = line.size();
    path_ = path;
    last_.clear();
    last_.push_back(start);
    if (open_) note(Kind::Open, address_);
    return {};
}

void SessionLog::end() {
    if (!writing()) return;
    if (last_.empty() || last_.back().kind != Kind::Closed) note(Kind::Closed, "");
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
    last_.push_back({clock_.micros() - began_, kind, std::move(text)});
    if (last_.size() > kKept) last_.pop_front();
    Noted(last_.back());
    if (writing()) write(sessionLine(last_.back()) + kEnd);
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
    for (SessionEvent event : last_) {
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
