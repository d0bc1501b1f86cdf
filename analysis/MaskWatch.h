#pragma once
// What happens when a sweep fails the mask: it is saved, sweeps after it are recorded, a command
// runs.

#include <cstddef>
#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <vector>

#include "analysis/Mask.h"
#include "platform/Clock.h"
#include "platform/Command.h"
#include "platform/Files.h"
#include "trace/Sweep.h"

namespace zel {

struct WatchSettings {
    std::string file;                  ///< failing sweeps are added to it; empty: none is saved
    std::size_t after = 0;             ///< sweeps that are saved after each failing one as well
    std::vector<std::string> command;  ///< program and arguments; empty: none

    bool any() const { return !file.empty() || !command.empty(); }
};

/// The words of a line as a user types it: blanks part them, double quotes keep them together, a
/// doubled quote inside of quotes is one. Nothing where a quote has no end.
std::optional<std::vector<std::string>> commandWords(const std::string& line);

/// Unattended watching. A failure to save or to start never ends it: it is reported by `Problem`,
/// each text once until something has gone well again.
class MaskWatch {
  public:
    MaskWatch(FileService& files, CommandRunner& runner, const Clock& clock)
        : files_(files), runner_(runner), clock_(clock) {}

    /// Counts begin again.
    void set(WatchSettings settings);
    const WatchSettings& settings() const { return settings_; }

    /// A sweep with its verdict; one that no sample of the mask covers counts as passed. In the
    /// command's words "{x}", "{margin}", "{time}" and "{file}" stand for where the mask was missed
    /// most, by how much (dB, negative), when, and the file. While a command runs no second one
    /// begins; that is counted.
    void take(const Sweep& sweep, const MaskVerdict& verdict);
    /// Looks whether the command has ended, and how.
    void follow();

    std::uint64_t saved() const { return saved_; }
    std::uint64_t started() const { return started_; }
    /// Failing sweeps for which no command began, since the one before was at work.
    std::uint64_t passedOver() const { return passedOver_; }
    bool commandRuns() { return runner_.running(); }
    /// The last thing that went wrong; empty when all is well.
    const std::string& problem() const { return problem_; }
    /// "3 sweeps saved, 1 command started"; empty while nothing was done.
    std::string text() const;

    std::function<void(const std::string&)> Problem;

  private:
    void save(const Sweep& sweep);
    void run(const Sweep& sweep, const MaskVerdict& verdict);
    void report(std::string& last, const std::string& problem);

    FileService& files_;
    CommandRunner& runner_;
    const Clock& clock_;
    WatchSettings settings_;
    std::string running_;  ///< the program that was started last, also after other settings
    std::size_t due_ = 0;  ///< sweeps still to be saved after a failing one
    std::uint64_t saved_ = 0;
    std::uint64_t started_ = 0;
    std::uint64_t passedOver_ = 0;
    std::string problem_;
    std::string fileProblem_;
    std::string commandProblem_;
};

}  // namespace zel
