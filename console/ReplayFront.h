#pragma once
// A platform on which a recorded session stands for the instrument, in virtual time.

#include <cstdint>
#include <functional>
#include <memory>
#include <string>

#include "console/Fronts.h"
#include "support/SessionText.h"

namespace zel {

struct ReplayStage {
    std::unique_ptr<Front> front;
    /// Brings the front's clock to that many microseconds.
    std::function<void(std::int64_t)> passTo;
};

/// The record must outlive the front.
ReplayStage makeReplayFront(const SessionRecord& record, const std::string& home);

}  // namespace zel
