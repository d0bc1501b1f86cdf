#pragma once
// Starts a user's command as a process of its own.

#include <sys/types.h>

#include <optional>
#include <string>
#include <vector>

#include "platform/Command.h"

namespace zel {

/// The process has a group of its own, so that Ctrl+C at the terminal does not reach it, and goes
/// on when this program ends.
class SystemCommand : public CommandRunner {
  public:
    std::string start(const std::vector<std::string>& words) override;
    bool running() override;
    bool waitForEnd(int ms) override;
    std::optional<int> ended() override;

  private:
    pid_t child_ = 0;
    std::optional<int> status_;
};

}  // namespace zel
