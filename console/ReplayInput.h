#pragma once
// The lines and clicks of a recorded session, each in its turn.

#include <cstdint>
#include <string>
#include <vector>

#include "console/LineInput.h"
#include "platform/Clock.h"
#include "platform/Events.h"
#include "support/SessionCompare.h"

namespace zel {

/// A line comes at its time of the record, after all that the program sent before it. A program
/// that differs does not keep it back for ever.
class ReplayInput : public LineInput {
  public:
    ReplayInput(const SessionRecord& record, const SessionCompare& compare, const Clock& clock,
                Events& events);
    ~ReplayInput() override;

    Got next(std::string& line, bool block) override;

  private:
    struct Item {
        std::size_t event;
        std::int64_t micros;
        std::string line;
    };
    bool due(const Item& item);

    const SessionCompare& compare_;
    const Clock& clock_;
    Events& events_;
    std::vector<Item> items_;
    std::size_t at_ = 0;
    std::int64_t origin_;
    std::int64_t end_ = 0;  ///< microseconds of the record
    TaskId task_ = 0;
};

}  // namespace zel
