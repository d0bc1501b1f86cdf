#pragma once
// The plain log: a line a call, in a file that is opened and closed for each.

#include <cstdint>
#include <string>

#include "platform/Clock.h"
#include "platform/Files.h"

namespace zel {

/// A log that cannot be written disturbs nothing: the line is lost.
class DebugIf {
  public:
    /// The file is put aside as "NAME.1.log" before it grows beyond this; three old ones stay.
    static constexpr std::uint64_t kLargestFile = 5'000'000;
    static constexpr int kOldFiles = 3;

    DebugIf(const Clock& clock, FileService& files) : clock_(clock), files_(files) {}

    std::string DebugFileName;  ///< the file to append to
    bool STAT = false;          ///< false: `OutputDebug` does nothing
    std::string DebugHeader;    ///< stands before the text of each line
    bool TimeSamping = false;   ///< each line begins with the seconds since midnight

    /// Deletes the file, if it is there; the next line begins a new one.
    void KillOld();
    void OutputDebug(const std::string& text);

  private:
    void putAside();

    const Clock& clock_;
    FileService& files_;
};

}  // namespace zel
