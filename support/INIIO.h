#pragma once
// Values in ini files, each read and written as the type it is wanted as.

#include <cstdint>
#include <optional>
#include <string>
#include <variant>

#include "platform/Files.h"

namespace zel {

using IniValue = std::variant<bool, std::int16_t, std::int32_t, float, double, std::string>;

enum class IniType { Boolean, Integer, Long, Single, Double, Text };

/// The value of a key, as the type that is named or else as the default's. A missing key gives
/// the default; a missing default counts as the number 1. A value is cut after 750 characters.
/// "1", "WAHR" and "TRUE" in either case are true; a number is what the text starts with, for the
/// whole types the nearest that they hold.
IniValue ReadIni(FileService& files, const std::string& fileName, const std::string& section,
                 const std::string& key, const std::optional<IniValue>& fallback = std::nullopt,
                 std::optional<IniType> valueType = std::nullopt);

/// A boolean is written as "1" or "0", a text as it stands, a number as its text. False when the
/// file cannot be read or written, or when no line can hold the names; it is then as it was.
bool WriteIni(FileService& files, const std::string& fileName, const std::string& section,
              const std::string& key, const IniValue& value);

}  // namespace zel
