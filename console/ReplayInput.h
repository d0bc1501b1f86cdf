#pragma once
// The lines and clicks of a recorded session, each in its turn.

#include <cstddef>
#include <cstdint>
#include <functional>
#include <string>
#include <vector>

#include "console/ConsoleDialogs.h"
#include "console/LineInput.h"
#include "platform/Clock.h"
#include "platform/Events.h"
#include "support/SessionCompare.h"
#include "support/SessionText.h"

namespace zel {

/// How far a program has come in a record.
struct ReplayProgress {
    explicit ReplayProgress(const SessionRecord& record) : compare(record) {}
    SessionCompare compare;
    std::size_t came = 0;  ///< bytes from the instrument
};

/// A line comes at its time of the record, after all that the program sent and got before it; or
/// up to a quarter of a second earlier, when it is what happened next: drawing takes no time here,
/// and the program would be beyond the line when its time has come. A program that differs does
/// not keep it back for ever.
class ReplayInput : public LineInput {
  public:
    /// `passTo` brings a clock that can be moved to that many microseconds; it may be empty.
    ReplayInput(const SessionRecord& record, const ReplayProgress& progress, const Clock& clock,
                Events& events, std::function<void(std::int64_t)> passTo);
    ~ReplayInput() override;

    /// Ends the program after the last line, of a record that the user ended: how the session went
    /// on is not in it. Empty where the end of the session is in the record.
    std::function<void()> cutShort;

    Got next(std::string& line, bool block) override;
    /// Waits for the answer to a question that stands open, until its turn has come; events run
    /// meanwhile, as in a window. At once where the record goes on with another line.
    void awaitAnswer(AnswerQueue& answers);

  private:
    struct Item {
        std::size_t event;
        std::int64_t micros;
        std::size_t came;  // bytes from the instrument before it
        std::string line;
    };
    bool due(const Item& item);

    const ReplayProgress& progress_;
    const Clock& clock_;
    Events& events_;
    std::function<void(std::int64_t)> passTo_;
    std::vector<Item> items_;
    std::size_t at_ = 0;
    std::int64_t origin_;
    std::int64_t end_ = 0;  ///< microseconds of the record
    TaskId task_ = 0;
};

}  // namespace zel
