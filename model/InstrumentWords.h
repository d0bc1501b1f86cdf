#pragma once
// The words of the instrument's line protocol, for who writes to it: meaning, unit, range, codes.

#include <optional>
#include <span>
#include <string>
#include <string_view>

#include "model/CodeTables.h"

namespace zel {

// What a word can be used with; a sum of these.
inline constexpr unsigned kWordCmd = 1;
inline constexpr unsigned kWordSet = 2;
inline constexpr unsigned kWordGet = 4;

struct InstrumentWord {
    std::string_view word;
    unsigned verbs;  ///< sum of `kWordCmd` and the others
    std::string_view meaning;
    std::string_view unit = {};
    /// Range of a value on the wire, or its codes where no table holds them.
    std::string_view range = {};
    std::optional<CodeTable> codes = std::nullopt;
};

std::span<const InstrumentWord> instrumentWords();
/// "0 dBm, 1 dBmV, ..." of a word with codes, else its range; empty for a word without a value.
std::string wordValues(const InstrumentWord& word);
/// Word, meaning, unit, range or codes, with tabs between.
std::string wordLine(const InstrumentWord& word);

}  // namespace zel
