#pragma once
// A program that a fault ends leaves the trace of its calls.

#include <string>
#include <vector>

namespace zel {

/// From now on a fault (SIGSEGV, SIGABRT, SIGBUS, SIGFPE, SIGILL) adds its trace at the end of each
/// of the files (three at most); then the program ends by the signal.
void traceFaultsInto(const std::vector<std::string>& files);

}  // namespace zel
