#pragma once
// A sweep as a saved view, without a question to the instrument and without a box.

#include <string>

#include "files/OutputFile.h"
#include "platform/Clock.h"
#include "platform/Files.h"
#include "trace/Sweep.h"

namespace zel {

/// The rows of a view: x in hertz (0 at zero span) and value; two values with the auto peak
/// detector. The x of the last row.
double writeSweepRows(OutputFile& file, const Sweep& sweep);

/// Adds the sweep with its header to the end of a file, which begins with it where there is none:
/// a recording. A bandwidth that the instrument chooses by itself is named as such. What went
/// wrong, for a user; else an empty text, and the file is as it was where something did.
std::string appendSweep(FileService& files, const std::string& path, const Sweep& sweep,
                        const Clock& clock);

}  // namespace zel
