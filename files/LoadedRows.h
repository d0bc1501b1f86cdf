#pragma once
// Reads the rows of one trace out of a file's entries, converted for display.

#include <cstddef>
#include <string_view>

#include "files/FieldList.h"
#include "forms/ControllerForm.h"
#include "model/ZEL3Variables.h"

namespace zel {

class LoadedRows {
  public:
    LoadedRows(ControllerForm& panel, const ZEL3Variables& mirror)
        : panel_(panel), mirror_(mirror) {}

    /// Fills `DataXAxisArrayToLoad` and `DataValArrayToLoad` with at most 301 rows from the entry
    /// `startIndex` on. `nextIndex` is the entry after the rows, or -1 when the text is used up.
    /// Returns how many rows were there; the arrays, `RawTraceData` too, hold as many.
    int ReadDataRows(const FieldList& lines, bool autoPeak, int startIndex, int& nextIndex);
    /// A value of the file in the reference unit, as the graph shows it.
    double ConvertLoadedValue(double value) const;

    static constexpr std::size_t kRows = 301;

  private:
    /// How the values of a trace become what the graph shows.
    enum class Scale { AsTheyAre, Volts, Watts, Percent };
    Scale scale() const;
    double converted(double value, Scale scale) const;

    ControllerForm& panel_;
    const ZEL3Variables& mirror_;
};

/// The number of an entry, with point or comma; 0 for what is none.
double fieldNumber(std::string_view field);
/// True where an entry begins as a number does.
bool looksLikeNumber(std::string_view field);

}  // namespace zel
