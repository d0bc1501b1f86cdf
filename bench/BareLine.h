#pragma once
// The least that a program can do to fetch sweeps: termios, poll, read and write in a loop.

#include <cstddef>
#include <string>
#include <string_view>

namespace zelbench {

/// Every routine throws std::runtime_error when the instrument is silent or refuses.
class BareLine {
  public:
    /// Opens the terminal raw at `baud` and takes the instrument into remote control.
    BareLine(const std::string& device, int baud);
    ~BareLine();
    BareLine(const BareLine&) = delete;
    BareLine& operator=(const BareLine&) = delete;

    /// The words of a full read cycle, in its order; the samples are read and not looked at.
    void sweep();
    /// The words of a pass of the continuous view: the wait for the sweep, and its samples.
    void pass();
    std::string get(std::string_view word);
    /// Keyword, comma, value.
    void set(std::string_view setting);
    /// Bytes on the line so far, both ways.
    std::size_t bytes() const { return bytes_; }

  private:
    void command(std::string_view word) { order("cmd\r", word); }
    void order(std::string_view kind, std::string_view text);
    void write(std::string_view bytes);
    void readMore();
    std::string_view line();
    void accepted();

    int line_ = -1;
    std::size_t sampleBytes_ = 0;  // of a sweep, with the separators after the blocks
    std::size_t bytes_ = 0;
    std::string buffer_;
    std::size_t taken_ = 0;
};

}  // namespace zelbench
