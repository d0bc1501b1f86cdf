#include "waterfall/SweepHistory.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <memory>
#include <string>
#include <utility>
#include <vector>

#include "forms/Forms.h"
#include "platform/Graph.h"
#include "platform/Graph3D.h"
#include "support/NumberText.h"

namespace zel {
namespace {

constexpr double kSteps = 65535;
constexpr const char* kXFormat = "#.000";

SweepHeader takenApart(const std::string& text) {
    const auto begin = text.find("Date;");
    const auto time = text.find("Time;", begin == std::string::npos ? 0 : begin);
    if (begin == std::string::npos || time == std::string::npos) return {text, "", ""};
    auto end = text.find('\n', time);
    end = end == std::string::npos ? text.size() : end + 1;
    return {text.substr(0, begin), text.substr(begin, end - begin), text.substr(end)};
}

/// The shortest digits that give the same single number, as a double: 0.1 and not 0.10000000149.
double plainNumber(float value) {
    std::array<char, 64> buffer{};
    const auto result = std::to_chars(buffer.data(), buffer.data() + buffer.size(), value);
    return leadingNumber({buffer.data(), result.ptr});
}

}  // namespace

HistoryRow::HistoryRow(const std::vector<double>& shown, double low, double high,
                       const std::vector<double>& raw)
    : low_(std::isfinite(low) ? low : 0),
      step_(std::isfinite(high - low) ? (high - low) / kSteps : 0) {
    const std::size_t count = std::min(shown.size(), SweepHistory::kLongestRow);
    shown_.resize(count);
    for (std::size_t i = 0; i < count && step_ != 0; ++i) {
        // Values below the axis and those that are no numbers are its lowest step.
        const double place = (shown[i] - low_) / step_ + 0.5;
        shown_[i] = place > 0 ? static_cast<std::uint16_t>(std::min(place, kSteps)) : 0;
    }
    raw_.assign(raw.begin(), raw.begin() + static_cast<std::ptrdiff_t>(
                                               std::min(raw.size(), SweepHistory::kLongestRow)));
}

HistoryRow::HistoryRow(std::vector<std::uint16_t> codes, double low, double step)
    : shown_(std::move(codes)), low_(low), step_(step) {}

double HistoryRow::level(std::size_t index) const { return low_ + step_ * shown_[index]; }

std::vector<double> HistoryRow::levels() const {
    std::vector<double> levels(size());
    for (std::size_t i = 0; i < levels.size(); ++i) levels[i] = level(i);
    return levels;
}

SweepHistory::SweepHistory(Forms& forms) : panel_(forms.controller), form_(forms.waterfall) {
    handlers_.on(form_.Graph3D.Plotted, [this] { take(); });
    handlers_.on(form_.clearGraph, [this] { clear(); });
    handlers_.on(form_.VewClear.Clicked, [this] { clear(); });
}

void SweepHistory::take() {
    const GraphCurve3D* plot = form_.Graph3D.lastRow();
    if (plot == nullptr) return;
    const GraphAxis& axis = form_.Graph3D.axis(3);
    const bool live = !panel_.Shown.fromFile;
    HistoryRow row(plot->level, axis.Minimum, axis.Maximum,
                   live ? panel_.RawTraceData : std::vector<double>());
    row.time = plot->time;
    row.firstX = panel_.CWGraph1.firstX();
    row.increment = panel_.CWGraph1.increment();
    constexpr std::size_t kMostSingles = 301;
    row.pairs = plot->level.size() > kMostSingles;
    if (live && describe) {
        SweepHeader header = takenApart(describe());
        row.moment = std::move(header.moment);
        header.moment.clear();
        const auto same = [&header](const std::shared_ptr<const SweepHeader>& other) {
            return other && other->head == header.head && other->tail == header.tail;
        };
        row.header = !rows_.empty() && same(rows_.back().header)
                         ? rows_.back().header
                         : std::make_shared<const SweepHeader>(std::move(header));
    }
    add(std::move(row));
}

void SweepHistory::add(HistoryRow row) {
    rows_.push_back(std::move(row));
    if (rows_.size() > kRows) rows_.pop_front();
    ++added_;
    Added();
}

void SweepHistory::clear() {
    if (rows_.empty()) return;
    rows_.clear();
    Cleared();
}

std::string SweepHistory::recording() const {
    std::string text;
    for (const HistoryRow& row : rows_) {
        if (!row.header || row.raw().empty()) continue;
        text += row.header->head + row.moment + row.header->tail;
        const std::vector<float>& values = row.raw();
        const std::size_t width = row.pairs ? 2 : 1;
        for (std::size_t i = 0; i < values.size(); i += width) {
            text += formatPattern(row.firstX + static_cast<double>(i) * row.increment, kXFormat);
            text += ';' + generalNumber(plainNumber(values[i])) + ';';
            text += row.pairs
                        ? generalNumber(i + 1 < values.size() ? plainNumber(values[i + 1]) : 0)
                        : std::string(" ");
            text += "\r\n";
        }
    }
    return text;
}

}  // namespace zel
