#pragma once
// A platform on which a recorded session stands for the instrument, in virtual time.

#include <memory>
#include <string>

#include "console/Fronts.h"
#include "support/SessionText.h"

namespace zel {

/// The record must outlive the front.
std::unique_ptr<Front> makeReplayFront(const SessionRecord& record, const std::string& home);

}  // namespace zel
