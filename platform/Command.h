#pragma once
// A program that the user names runs beside this one.

#include <optional>
#include <string>
#include <vector>

namespace zel {

class CommandRunner {
  public:
    virtual ~CommandRunner() = default;
    /// Starts the program of the first word with the others as its arguments, without a shell, with
    /// nothing to read and its output on the standard error. Why that failed, for a user; else an
    /// empty text.
    virtual std::string start(const std::vector<std::string>& words) = 0;
    /// The program that was started last is still at work.
    virtual bool running() = 0;
    /// Waits until it has ended, in real time and `ms` milliseconds at most. False when it runs on.
    virtual bool waitForEnd(int ms) = 0;
    /// The status with which it ended, once; nothing while it runs and when that was asked before.
    /// 128 and the signal's number for one that a signal ended.
    virtual std::optional<int> ended() = 0;
};

}  // namespace zel
