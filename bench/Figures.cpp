#include "bench/Figures.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <chrono>
#include <cmath>
#include <cstddef>
#include <functional>
#include <string>
#include <vector>

namespace zelbench {
namespace {

std::string fixed(double value, int decimals) {
    std::array<char, 400> room{};
    const auto end = std::to_chars(room.data(), room.data() + room.size(), value,
                                   std::chars_format::fixed, decimals);
    return {room.data(), end.ptr};
}

}  // namespace

bool Figure::met() const {
    if (!note.empty()) return false;
    if (limit == 0) return true;
    return atLeast ? ratio >= limit : ratio < limit;
}

std::string markdownTable(const Figures& figures) {
    std::string table =
        "| what | measured | held against | ratio | limit | met |\n"
        "| --- | --- | --- | --- | --- | --- |\n";
    for (const Figure& figure : figures) {
        table += "| " + figure.what + " | ";
        if (!figure.note.empty()) {
            table += "not measured: " + figure.note + " | | | | no |\n";
            continue;
        }
        table += figure.measured + " | " + figure.against + " | ";
        // Three digits after the point hide nothing of a ratio that is near its limit.
        table += fixed(figure.ratio, figure.ratio < 0.01 ? 5 : 3) + " | ";
        if (figure.limit == 0) {
            table += "none | |\n";
        } else {
            table += (figure.atLeast ? "at least " : "below ") + numberText(figure.limit) + " | ";
            table += figure.met() ? "yes |\n" : "**no** |\n";
        }
    }
    return table;
}

double now() {
    return std::chrono::duration<double>(std::chrono::steady_clock::now().time_since_epoch())
        .count();
}

double timeOf(const std::function<void()>& work) {
    const double start = now();
    work();
    return now() - start;
}

double median(std::vector<double> values) {
    if (values.empty()) return 0;
    std::sort(values.begin(), values.end());
    const std::size_t half = values.size() / 2;
    return values.size() % 2 == 1 ? values[half] : (values[half - 1] + values[half]) / 2;
}

std::string numberText(double value) {
    const double size = std::abs(value);
    const int digits = size == 0 ? 0 : static_cast<int>(std::floor(std::log10(size))) + 1;
    std::string text = fixed(value, std::clamp(3 - digits, 0, 9));
    if (text.find('.') != std::string::npos) {
        text.erase(text.find_last_not_of('0') + 1);
        if (text.back() == '.') text.pop_back();
    }
    return text;
}

std::string timeText(double seconds) {
    if (seconds >= 1) return numberText(seconds) + " s";
    if (seconds >= 1e-3) return numberText(seconds * 1e3) + " ms";
    return numberText(seconds * 1e6) + " us";
}

}  // namespace zelbench
