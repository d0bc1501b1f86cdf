#pragma once
// Where the traces of a recording stand in its text, found as far as they are asked for.

#include <cstddef>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "files/FieldList.h"

namespace zel {

class SeriesFrames {
  public:
    struct Frame {
        int start = 0;      ///< entry of the first row
        std::string label;  ///< time of day of the trace and day of the file
        std::string time;   ///< of day, as it stands in the file
        int second = -1;    ///< of the day; -1 without a time
    };

    /// The first trace begins at the entry `start`, each further one after an entry that holds
    /// `markWord`. `fileTime` is day and time of the file.
    SeriesFrames(std::shared_ptr<const std::string> text, FieldList lines, int start,
                 std::string_view markWord, const std::string& fileTime);

    const FieldList& lines() const { return lines_; }
    const std::string& text() const { return *text_; }
    const std::string& fileTime() const { return fileTime_; }
    /// Number of the file's traces; those that are cut off at its end may count.
    int count() const { return count_; }
    /// Whether there is a trace of that index.
    bool reach(int index);
    /// After `reach`.
    const Frame& at(int index) const { return frames_.at(static_cast<std::size_t>(index)); }
    /// The rows of the last trace that is known end before that entry, which saves a search.
    void rowsEnd(int index, int entry);
    /// There are no rows at that index and after it.
    void endAt(int index);
    /// Milliseconds from that trace to the next by their stamps. Traces of one second share it
    /// evenly.
    int gapAfter(int index);

  private:
    void add(int start, std::optional<int> time);

    std::shared_ptr<const std::string> text_;
    FieldList lines_;
    std::string markWord_;
    std::string fileTime_;
    std::vector<Frame> frames_;
    int searchFrom_ = 0;
    int count_ = 0;
    bool complete_ = false;
};

/// Seconds since midnight of "14:03:22" or "02:03:22 PM", -1 for what is no time.
int secondOfDay(std::string_view time);

}  // namespace zel
