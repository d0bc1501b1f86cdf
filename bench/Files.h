#pragma once
// What saved files cost: loading a recording, writing a view, playing a series.

#include "bench/Figures.h"

namespace zelbench {

/// Loading a recording of 1,000 traces through the program: megabytes of text a second.
Figure loadRate();
/// The same beside a plain pass over the file that reads it and turns each field into a number.
Figure loadBesidePlainPass();
/// Writing one view with its header into a file.
Figure viewWriting();
/// A series at the slider's top, each trace drawn by the panel's window without a display.
Figure seriesPlay();

}  // namespace zelbench
