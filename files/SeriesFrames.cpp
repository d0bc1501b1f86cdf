#include "files/SeriesFrames.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cstddef>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <system_error>
#include <utility>

#include "files/FieldList.h"
#include "files/ViewFormat.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr int kDay = 24 * 60 * 60;
constexpr int kNoon = 12;
constexpr int kMsPerSecond = 1000;

int occurrences(std::string_view text, std::string_view word) {
    int count = 0;
    for (std::size_t at = text.find(word); at != std::string_view::npos;
         at = text.find(word, at + word.size()))
        ++count;
    return count;
}

}  // namespace

int secondOfDay(std::string_view time) {
    std::array<int, 3> parts{};
    const char* at = time.data();
    const char* const end = at + time.size();
    for (std::size_t i = 0; i < parts.size(); ++i) {
        if (i > 0 && (at == end || *at++ != ':')) return -1;
        const auto [stop, problem] = std::from_chars(at, end, parts[i]);
        if (problem != std::errc() || parts[i] < 0 || parts[i] >= (i == 0 ? 24 : 60)) return -1;
        at = stop;
    }
    const std::string_view rest(at, static_cast<std::size_t>(end - at));
    if (rest.find("PM") != std::string_view::npos && parts[0] < kNoon) parts[0] += kNoon;
    if (rest.find("AM") != std::string_view::npos && parts[0] == kNoon) parts[0] = 0;
    return (parts[0] * 60 + parts[1]) * 60 + parts[2];
}

SeriesFrames::SeriesFrames(std::shared_ptr<const std::string> text, FieldList lines, int start,
                           std::string_view markWord, const std::string& fileTime)
    : text_(std::move(text)),
      lines_(std::move(lines)),
      markWord_(markWord),
      fileTime_(fileTime),
      searchFrom_(start),
      count_(markWord.empty() ? 1 : occurrences(*text_, markWord)) {
    std::optional<int> time;
    for (int i = 0; i < start && !time; ++i)
        if (contains(lines_[i], kTime)) time = i;
    add(start, time);
}

void SeriesFrames::add(int start, std::optional<int> time) {
    Frame frame;
    frame.start = start;
    if (time) {
        const std::string stamp(lines_[*time + 1]);
        frame.label = stamp + " " + fileTime_.substr(0, kDayLength);
        frame.time = stamp;
        frame.second = secondOfDay(stamp);
    } else if (!frames_.empty()) {
        frame.label = frames_.back().label;
        frame.time = frames_.back().time;
        frame.second = frames_.back().second;
    }
    frames_.push_back(std::move(frame));
}

void SeriesFrames::rowsEnd(int index, int entry) {
    if (index + 1 == static_cast<int>(frames_.size())) searchFrom_ = std::max(searchFrom_, entry);
}

void SeriesFrames::endAt(int index) {
    complete_ = true;
    frames_.resize(std::min(frames_.size(), static_cast<std::size_t>(std::max(index, 1))));
    count_ = static_cast<int>(frames_.size());
}

bool SeriesFrames::reach(int index) {
    if (index < 0) return false;
    while (static_cast<int>(frames_.size()) <= index && !complete_) {
        std::optional<int> time;
        std::optional<int> mark;
        for (int i = searchFrom_; i <= lines_.last() && !mark && !markWord_.empty(); ++i) {
            const std::string_view entry = lines_[i];
            if (!time && contains(entry, kTime)) time = i;
            if (contains(entry, markWord_)) mark = i;
        }
        if (!mark) {
            complete_ = true;
            count_ = static_cast<int>(frames_.size());
            break;
        }
        searchFrom_ = *mark + kRowsAfterMark;
        add(searchFrom_, time);
    }
    return index < static_cast<int>(frames_.size());
}

int SeriesFrames::gapAfter(int index) {
    if (!reach(index) || at(index).second < 0) return 0;
    const int second = at(index).second;
    int first = index;
    while (first > 0 && at(first - 1).second == second) --first;
    int next = index + 1;
    while (reach(next) && at(next).second == second) ++next;
    const int share = kMsPerSecond / (next - first);
    if (next > index + 1 || !reach(next)) return share;
    // The last of its second waits for the stamp of the next one.
    const int seconds = (at(next).second - second + kDay) % kDay;
    return seconds * kMsPerSecond - (next - 1 - first) * share;
}

}  // namespace zel
