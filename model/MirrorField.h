#pragma once
// A field of the mirror, named in a table.

#include <cstdint>
#include <string>
#include <variant>

#include "model/ZEL3Variables.h"

namespace zel {

/// std::monostate: none.
using MirrorField =
    std::variant<std::monostate, double ZEL3Variables::*, std::int16_t ZEL3Variables::*,
                 std::uint8_t ZEL3Variables::*, std::string ZEL3Variables::*>;

/// Stores an answer or an entry: a number field takes the number, rounded and clamped to what the
/// field holds, a text field the text.
void storeField(ZEL3Variables& mirror, const MirrorField& field, double number,
                const std::string& text);
/// The field as a number: of a text its leading number, 0 of none.
double fieldNumber(const ZEL3Variables& mirror, const MirrorField& field);

}  // namespace zel
