#pragma once
// A file's text cut into its entries: the fields between semicolons and line ends.

#include <cstddef>
#include <cstdint>
#include <functional>
#include <string_view>
#include <vector>

namespace zel {

/// Holds places, not copies: the text must stay where it is and is shorter than 4 GB. At least one
/// entry, which is empty for an empty text. CR, LF and CR LF end a line alike. The places take at
/// most a quarter of the text's memory, whatever stands in it.
class FieldList {
  public:
    /// `yield` is called every few megabytes with the part that is done, 0 to 1.
    explicit FieldList(std::string_view text, const std::function<void(double)>& yield = {});

    int count() const { return count_; }
    int last() const { return count_ - 1; }
    /// Empty beyond the last. Quick for the entry of the call before and the one after it; else a
    /// few entries are walked.
    std::string_view at(int index) const {
        if (index < 0 || index > last()) return {};
        if (index != index_) find(index);
        return {text_.data() + start_, end_ - start_};
    }
    std::string_view operator[](int index) const { return at(index); }

  private:
    void find(int index) const;
    std::size_t endOf(std::size_t start) const;
    std::size_t next(std::size_t end) const;

    std::string_view text_;
    int count_ = 0;
    std::vector<std::uint32_t> starts_;  ///< of every sixteenth entry
    // Where the last call found its entry.
    mutable int index_ = -1;
    mutable std::size_t start_ = 0;
    mutable std::size_t end_ = 0;
};

}  // namespace zel
