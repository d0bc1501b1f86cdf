#pragma once
// Lines of text out, each flushed at once; a line that may repeat is held back and counted.

#include <ostream>
#include <string>
#include <vector>

namespace zel {

class LineOutput {
  public:
    explicit LineOutput(std::ostream& stream) : stream_(stream) {}

    void line(const std::string& text);
    /// Many at once, with one flush.
    void lines(const std::vector<std::string>& texts);
    /// Held until another line, or until `settle`; the same text again raises its count, and
    /// " (3 times)" then stands behind it.
    void repeatable(const std::string& text);
    /// Writes what is held back.
    void settle();

  private:
    void write(const std::string& text);

    std::ostream& stream_;
    std::string held_;
    int count_ = 0;
};

}  // namespace zel
