#pragma once
// Pictures in files: the console gives the graphs as data to `zeldraw`, which draws them.

#include <string>

#include "shell/Program.h"

namespace zel {

/// The program that draws: beside this one, or in the PATH. Empty where there is none.
std::string findDrawingProgram();
/// What to do about a missing `findDrawingProgram`.
extern const char* const kNoDrawingProgram;

/// Draws the panel's graph; what went wrong, else an empty text.
std::string drawGraphImage(Program& program, const std::string& file);
/// The same, in words that stand alone.
std::string writeGraphImage(Program& program, const std::string& file);
/// Draws the waterfall as its window shows it; what went wrong, else an empty text.
std::string drawWaterfallImage(Program& program, const std::string& file);
/// Draws all its rows, in depth or from above, in words that stand alone.
std::string writeRowsImage(Program& program, const std::string& file, bool spectrogram);

}  // namespace zel
