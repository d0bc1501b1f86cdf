#include "model/MirrorField.h"

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <limits>
#include <string>
#include <variant>

#include "model/ZEL3Variables.h"
#include "support/NumberText.h"

namespace zel {
namespace {

template <class Whole>
Whole wholeNumber(double number) {
    return static_cast<Whole>(std::clamp(std::nearbyint(number),
                                         static_cast<double>(std::numeric_limits<Whole>::min()),
                                         static_cast<double>(std::numeric_limits<Whole>::max())));
}

}  // namespace

void storeField(ZEL3Variables& mirror, const MirrorField& field, double number,
                const std::string& text) {
    if (const auto* real = std::get_if<double ZEL3Variables::*>(&field)) {
        mirror.*(*real) = number;
    } else if (const auto* word = std::get_if<std::int16_t ZEL3Variables::*>(&field)) {
        mirror.*(*word) = wholeNumber<std::int16_t>(number);
    } else if (const auto* byte = std::get_if<std::uint8_t ZEL3Variables::*>(&field)) {
        mirror.*(*byte) = wholeNumber<std::uint8_t>(number);
    } else if (const auto* string = std::get_if<std::string ZEL3Variables::*>(&field)) {
        mirror.*(*string) = text;
    }
}

double fieldNumber(const ZEL3Variables& mirror, const MirrorField& field) {
    if (const auto* real = std::get_if<double ZEL3Variables::*>(&field)) return mirror.*(*real);
    if (const auto* word = std::get_if<std::int16_t ZEL3Variables::*>(&field))
        return mirror.*(*word);
    if (const auto* byte = std::get_if<std::uint8_t ZEL3Variables::*>(&field))
        return mirror.*(*byte);
    if (const auto* string = std::get_if<std::string ZEL3Variables::*>(&field))
        return leadingNumber(mirror.*(*string));
    return 0;
}

}  // namespace zel
