#include "files/FieldList.h"

namespace zel {
namespace {

constexpr std::size_t kYieldEvery = std::size_t{4} * 1024 * 1024;
constexpr std::size_t kUsualField = 8;

bool isSeparator(char c) { return c == ';' || c == '\r' || c == '\n'; }

}  // namespace

FieldList::FieldList(std::string_view text, const std::function<void(double)>& yield)
    : text_(text) {
    ends_.reserve(text.size() / kUsualField + 1);
    const std::size_t size = text.size();
    std::size_t nextYield = kYieldEvery;
    for (std::size_t at = 0; at < size; ++at) {
        if (!isSeparator(text[at])) continue;
        ends_.push_back(static_cast<std::uint32_t>(at));
        if (text[at] == '\r' && at + 1 < size && text[at + 1] == '\n') ++at;
        if (at < nextYield) continue;
        nextYield = at + kYieldEvery;
        if (yield) yield(static_cast<double>(at) / static_cast<double>(size));
    }
    ends_.push_back(static_cast<std::uint32_t>(size));
}

}  // namespace zel
