#pragma once
// Lines of text in: from a file, or from a descriptor that may have nothing yet.

#include <cstddef>
#include <istream>
#include <string>

namespace zel {

/// Longest line that is taken, in bytes; of a longer one nothing is.
inline constexpr std::size_t kLongestLine = 65536;

class LineInput {
  public:
    enum class Got {
        Line,
        TooLong,  ///< a line above the limit was passed over
        Nothing,  ///< no whole line has come yet; never with `block`
        End,
    };
    virtual ~LineInput() = default;
    /// The next line, without its end, as it stands.
    virtual Got next(std::string& line, bool block) = 0;
};

/// The lines of a stream, which are all there or are waited for.
class StreamLines : public LineInput {
  public:
    explicit StreamLines(std::istream& stream) : stream_(stream) {}
    Got next(std::string& line, bool block) override;

  private:
    std::istream& stream_;
};

/// The lines of a file descriptor such as standard input. It reads ahead by no more than 1,000
/// lines; whoever writes faster has to wait.
class DescriptorLines : public LineInput {
  public:
    /// A wait for a line ends, with nothing, when the second descriptor can be read.
    explicit DescriptorLines(int descriptor, int wakeDescriptor = -1)
        : descriptor_(descriptor), wakeDescriptor_(wakeDescriptor) {}
    Got next(std::string& line, bool block) override;

  private:
    bool fill(bool block);
    bool take(std::string& line, Got& got);

    int descriptor_;
    int wakeDescriptor_;
    std::string waiting_;
    bool passingOver_ = false;  ///< inside of a line that is too long
    bool ended_ = false;
};

}  // namespace zel
