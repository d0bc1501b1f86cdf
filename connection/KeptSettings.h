#pragma once
// The settings of an instrument as words, to say what differs after a reconnection.

#include <string>
#include <utility>
#include <vector>

#include "forms/ControllerForm.h"
#include "model/ZEL3Variables.h"

namespace zel {

/// Names and texts of what a handshake reads: instrument, mode, and in modes with a trace center,
/// span, level and sweep settings.
using KeptSettings = std::vector<std::pair<std::string, std::string>>;

KeptSettings keepSettingsOf(const ControllerForm& panel, const ZEL3Variables& mirror);

/// "Span 1 MHz (before: 10 MHz); RBW Auto (before: 30 kHz)"; empty when nothing differs. What only
/// one side has is left out.
std::string differenceOf(const KeptSettings& before, const KeptSettings& now);

}  // namespace zel
