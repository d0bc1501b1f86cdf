#pragma once
// The time of now as the structured log writes it.

#include <string>

#include "platform/Clock.h"

namespace zel {

class RootDebug;

/// "2026-01-31 23:59:59.1234", local time. The call shows in the log's stack.
std::string GetISOTimeString(const Clock& clock, RootDebug& log);

}  // namespace zel
