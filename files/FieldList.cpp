#include "files/FieldList.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <functional>

namespace zel {
namespace {

constexpr std::size_t kYieldEvery = std::size_t{4} * 1024 * 1024;
constexpr int kStep = 16;
constexpr std::size_t kUsualField = 8;

// One look a character: it is most of the work.
constexpr std::array<bool, 256> kSeparators = [] {
    std::array<bool, 256> separators{};
    for (const char c : {';', '\r', '\n'}) separators[static_cast<unsigned char>(c)] = true;
    return separators;
}();

bool isSeparator(char c) { return kSeparators[static_cast<unsigned char>(c)]; }

}  // namespace

std::size_t FieldList::endOf(std::size_t start) const {
    const char* const begin = text_.data();
    const char* const end = begin + text_.size();
    const char* at = begin + start;
    while (at < end && !isSeparator(*at)) ++at;
    return static_cast<std::size_t>(at - begin);
}

/// The start of the entry after the separator at `end`.
std::size_t FieldList::next(std::size_t end) const {
    const bool pair = text_[end] == '\r' && end + 1 < text_.size() && text_[end + 1] == '\n';
    return end + (pair ? 2 : 1);
}

FieldList::FieldList(std::string_view text, const std::function<void(double)>& yield)
    : text_(text) {
    starts_.reserve(text.size() / (kUsualField * kStep) + 1);
    std::size_t nextYield = kYieldEvery;
    for (std::size_t start = 0;;) {
        if (count_ % kStep == 0) starts_.push_back(static_cast<std::uint32_t>(start));
        ++count_;
        const std::size_t end = endOf(start);
        if (end == text.size()) break;
        start = next(end);
        if (end < nextYield) continue;
        nextYield = end + kYieldEvery;
        if (yield) yield(static_cast<double>(end) / static_cast<double>(text.size()));
    }
}

void FieldList::find(int index) const {
    if (index_ >= 0 && index == index_ + 1) {
        start_ = next(end_);
    } else {
        start_ = starts_[static_cast<std::size_t>(index / kStep)];
        for (int i = index % kStep; i > 0; --i) start_ = next(endOf(start_));
    }
    index_ = index;
    end_ = endOf(start_);
}

}  // namespace zel
