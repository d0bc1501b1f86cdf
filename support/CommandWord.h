#pragma once
// The words that the program was started with.

#include "forms/ControllerForm.h"

namespace zel {

/// Whether the program was started with that word (in upper case), anywhere in its command line
/// and in either case there. The answer is kept in STAT.
bool testCommandWord(ControllerForm& panel, const char* word);

}  // namespace zel
