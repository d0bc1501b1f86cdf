#pragma once
// One measured figure with its limit, and the small arithmetic of measuring.

#include <functional>
#include <string>
#include <vector>

namespace zelbench {

/// A row of the table. `ratio` is held against `limit`; a `limit` of 0 asks for nothing.
struct Figure {
    std::string what;
    std::string measured;
    std::string against;
    double ratio = 0;
    double limit = 0;
    bool atLeast = true;  ///< false: the ratio shall stay below the limit
    std::string note;     ///< why there is no figure; empty where there is one

    bool met() const;
};

using Figures = std::vector<Figure>;

/// The Markdown table, a row a figure.
std::string markdownTable(const Figures& figures);

/// Seconds of a clock that only runs on.
double now();
/// Seconds that `work` takes.
double timeOf(const std::function<void()>& work);
/// The middle value, 0 of none.
double median(std::vector<double> values);
/// "12.3" with three significant digits or more, no exponent.
std::string numberText(double value);
/// Seconds as "1.23 s", "4.56 ms" or "7.89 us".
std::string timeText(double seconds);

}  // namespace zelbench
