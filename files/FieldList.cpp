#include "files/FieldList.h"

#include <algorithm>

namespace zel {
namespace {

constexpr std::size_t kYieldEvery = 4 * 1024 * 1024;
constexpr std::size_t kUsualField = 8;

bool isSeparator(char c) { return c == ';' || c == '\r' || c == '\n'; }

}  // namespace

FieldList::FieldList(std::string_view text, const std::function<void(double)>& yield)
    : text_(text) {
    starts_.reserve(text.size() / kUsualField + 1);
    lengths_.reserve(text.size() / kUsualField + 1);
    std::size_t start = 0;
    std::size_t nextYield = kYieldEvery;
    const auto add = [this](std::size_t from, std::size_t to) {
        starts_.push_back(static_cast<std::uint32_t>(from));
        lengths_.push_back(static_cast<std::uint32_t>(to - from));
    };
    const char* const begin = text.data();
    const char* const end = begin + text.size();
    for (const char* at = begin; (at = std::find_if(at, end, isSeparator)) != end; ++at) {
        add(start, static_cast<std::size_t>(at - begin));
        if (*at == '\r' && at + 1 != end && at[1] == '\n') ++at;
        start = static_cast<std::size_t>(at + 1 - begin);
        if (start < nextYield) continue;
        nextYield = start + kYieldEvery;
        if (yield) yield(static_cast<double>(start) / static_cast<double>(text.size()));
    }
    add(start, text.size());
}

}  // namespace zel
