#pragma once
// What people type into an entry box, made into what the panel's number parser reads.

#include <string>
#include <string_view>

#include "panel/SoftPositions.h"

namespace zel {

/// A typed text as the panel reads it, or why it cannot be read.
struct EntryReading {
    bool ok = false;
    std::string text;     ///< for the box: a number with its prefix ("2.4 GHz"), or bare ("-30")
    std::string problem;  ///< in words, when it is not ok
    double value = 0;     ///< in the base unit
};

/// The kind of a value decides which units go with it. A comma is a decimal point where it can be
/// nothing else; "1,500" may be both and is not read. `Enter` is any number without a unit.
/// `MarkerX` and `TriggerValue` are to be made into one of the others first.
EntryReading readEntry(std::string_view typed, EntryUnit unit);

}  // namespace zel
