#pragma once
// A file's text cut into its entries: the fields between semicolons and line ends.

#include <cstdint>
#include <functional>
#include <string>
#include <string_view>
#include <vector>

namespace zel {

/// Holds places, not copies: the text must stay where it is. At least one entry, which is empty
/// for an empty text. CR, LF and CR LF end a line alike.
class FieldList {
  public:
    /// `yield` is called every few megabytes with the part that is done, 0 to 1.
    explicit FieldList(std::string_view text, const std::function<void(double)>& yield = {});

    int count() const { return static_cast<int>(ends_.size()); }
    int last() const { return count() - 1; }
    /// Empty beyond the last.
    std::string_view at(int index) const {
        if (index < 0 || index > last()) return {};
        const auto i = static_cast<std::size_t>(index);
        const std::size_t start = i == 0 ? 0 : behind(ends_[i - 1]);
        return text_.substr(start, ends_[i] - start);
    }
    std::string_view operator[](int index) const { return at(index); }

  private:
    /// The place behind the separator at `end`.
    std::size_t behind(std::size_t end) const {
        const bool pair = text_[end] == '\r' && end + 1 < text_.size() && text_[end + 1] == '\n';
        return end + (pair ? 2 : 1);
    }

    std::string_view text_;
    std::vector<std::uint32_t> ends_;
};

}  // namespace zel
