#pragma once
// What the server costs: sweeps and round trips through it beside those on the line itself.

#include <string>

#include "bench/Figures.h"

namespace zelbench {

/// Sweeps over TCP through the server to a paced line of 57,600 baud, beside the same on the line,
/// in rounds that take turns. `console` is the file of zelctl.
Figure servedPaced(const std::string& simulator, const std::string& console);
/// The same on a line that is not paced, with groups that go on at once.
Figure servedUnpaced(const std::string& simulator, const std::string& console);
/// How much longer a query takes through the server, beside the 15 ms that it may.
Figure servedRoundTrip(const std::string& simulator, const std::string& console);
/// The share of a core that a server without a client takes, beside a thousandth.
Figure servedIdle(const std::string& simulator, const std::string& console);
/// The memory of a server without a client, beside 30 MB.
Figure servedMemory(const std::string& simulator, const std::string& console);

}  // namespace zelbench
