#pragma once
// Lines of text out, each flushed at once; a line that may repeat is held back and counted.

#include <ostream>
#include <string>
#include <string_view>
#include <vector>

namespace zel {

/// The text with its control characters as \xNN.
std::string visibleText(std::string_view text);

class LineOutput {
  public:
    /// On a terminal control characters are shown and not sent to it.
    explicit LineOutput(std::ostream& stream, bool terminal = false)
        : stream_(stream), terminal_(terminal) {}

    void line(const std::string& text);
    /// Many at once, with one flush.
    void lines(const std::vector<std::string>& texts);
    /// Held until another line, or until `settle`; the same text again raises its count, and
    /// " (3 times)" then stands after it.
    void repeatable(const std::string& text);
    /// Writes what is held back.
    void settle();
    /// Why a line could not be written; empty while all could. Nothing is written after that.
    const std::string& problem() const { return problem_; }

  private:
    void write(const std::string& text);

    void put(const std::string& text);
    void flush();
    void note();

    std::ostream& stream_;
    bool terminal_;
    std::string problem_;
    std::string held_;
    int count_ = 0;
};

}  // namespace zel
