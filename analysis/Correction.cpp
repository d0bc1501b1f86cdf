#include "analysis/Correction.h"

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <optional>
#include <stdexcept>
#include <string>
#include <vector>

#include "analysis/SpectrumTrace.h"
#include "support/NumberText.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr std::size_t kMostRows = 100'000;
constexpr double kImpedance = 50;

/// dB to add for a voltage in dBuV of a level in `unit`; nothing where it is none.
std::optional<double> microvoltsOf(const std::string& unit) {
    if (unit == "dBm") return 10 * std::log10(kImpedance * 1e-3) + 120;
    if (unit == "dBmV") return 60;
    if (unit == "dBuV") return 0;
    return std::nullopt;
}

const char* kindName(CorrectionKind kind) {
    if (kind == CorrectionKind::Antenna) return "antenna ";
    return kind == CorrectionKind::Cable ? "cable " : "amplifier ";
}

}  // namespace

std::optional<double> Correction::at(double frequency) const {
    if (x.empty() || frequency < x.front() || frequency > x.back()) return std::nullopt;
    const auto above = std::lower_bound(x.begin(), x.end(), frequency);
    const auto i = static_cast<std::size_t>(above - x.begin());
    if (x[i] == frequency) return db[i];
    const double part = (frequency - x[i - 1]) / (x[i] - x[i - 1]);
    return db[i - 1] + part * (db[i] - db[i - 1]);
}

Correction readCorrection(const std::string& text, CorrectionKind kind, const std::string& name) {
    Correction table;
    table.kind = kind;
    table.name = name;
    int number = 0;
    for (std::string line : split(text, '\n')) {
        ++number;
        line = trimmed(line);
        if (!line.empty() && line.back() == '\r') line.pop_back();
        const auto wrong = [number](const std::string& what) {
            return std::runtime_error("line " + std::to_string(number) + ": " + what);
        };
        if (number == 1) {
            if (lowerCase(trimmed(line)) != "x;db") throw wrong("the header x;db is missing");
            continue;
        }
        if (trimmed(line).empty()) continue;
        const auto end = line.find(';');
        if (end == std::string::npos) throw wrong("a row is x;db");
        const auto x = parseNumber(line.substr(0, end));
        const auto db = parseNumber(line.substr(end + 1));
        if (!x || !db) throw wrong("this is no number: " + line);
        if (!table.x.empty() && *x <= table.x.back()) throw wrong("x does not rise");
        if (table.x.size() == kMostRows) throw wrong("the table is too long");
        table.x.push_back(*x);
        table.db.push_back(*db);
    }
    if (table.x.empty()) throw std::runtime_error("the table has no row");
    return table;
}

SpectrumTrace corrected(const SpectrumTrace& trace, const std::vector<Correction>& corrections) {
    SpectrumTrace result = trace;
    bool antenna = false;
    for (const Correction& table : corrections) {
        if (trace.xUnit != "Hz") throw std::runtime_error("corrections need a frequency axis");
        const bool factor = table.kind == CorrectionKind::Antenna;
        if (factor && antenna) throw std::runtime_error("two antennas are one too many");
        double added = 0;
        if (factor) {
            const auto microvolts = microvoltsOf(trace.unit);
            if (!microvolts)
                throw std::runtime_error("an antenna factor needs dBm, dBmV or dBuV, not " +
                                         trace.unit);
            added = *microvolts;
            antenna = true;
            result.unit = "dBuV/m";
        }
        const double sign = table.kind == CorrectionKind::Amplifier ? -1 : 1;
        for (std::size_t i = 0; i < result.level.size(); ++i) {
            const auto db = table.at(result.x[i]);
            if (!db)
                throw std::runtime_error(kindName(table.kind) + table.name +
                                         " does not cover the whole span");
            result.level[i] += added + sign * *db;
        }
    }
    return result;
}

std::string correctionNames(const std::vector<Correction>& corrections) {
    std::string names;
    for (const Correction& table : corrections)
        names += (names.empty() ? "" : ", ") + (kindName(table.kind) + table.name);
    return names;
}

const std::vector<VelocityFactor>& velocityFactors() {
    static const std::vector<VelocityFactor> list = {
        {"Polyethylene, solid (PE)", 0.66},   {"Teflon, solid (PTFE)", 0.695},
        {"Polyethylene, foam", 0.8},          {"Teflon, foam", 0.82},
        {"Polyethylene, gas injected", 0.85}, {"Air, with spacers", 0.93}};
    return list;
}

double faultDistance(double shown, double assumed, double factor) {
    return shown * factor / assumed;
}

}  // namespace zel
