#pragma once
// Reads the traces of a saved view or a recording, one after the other, without the panel.

#include <functional>
#include <string>
#include <string_view>

#include "analysis/SpectrumTrace.h"

namespace zel {

/// The order of day, month and year in the short dates of a desk.
enum class DateOrder { YearMonthDay, DayMonthYear, MonthDayYear };

/// The order that a desk writes, from its text of 3 February 2001 ("03.02.2001").
DateOrder dateOrderOf(std::string_view sample);

/// "2026-11-21T14:05:09" of a date and a time as a file holds them; empty when one of them makes no
/// sense. The place of the year decides where it can; `order` decides about the rest.
std::string isoTime(std::string_view date, std::string_view time, DateOrder order);

/// What becomes of each trace. False ends the reading.
using TraceSink = std::function<bool(const SpectrumTrace& trace)>;

/// Cuts a file into traces: a header (`Span;`, `Resolution Bandwidth;`, `Reference Unit;` ...) and
/// its rows "x;value" or "x;minimum;maximum", or rows alone, of which 301 make a trace. V and W
/// become dBm at 50 ohm. At zero span x is i times the sweep time / 300. Rows that are cut short
/// are left out. Throws std::runtime_error, with a text for the user, for an older log and for a
/// file without a trace.
void readTraces(std::string_view text, DateOrder order, const TraceSink& sink);

}  // namespace zel
