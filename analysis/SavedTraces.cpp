#include "analysis/SavedTraces.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <cstddef>
#include <limits>
#include <optional>
#include <stdexcept>
#include <string>
#include <string_view>
#include <system_error>
#include <utility>
#include <vector>

#include "analysis/SpectrumTrace.h"
#include "files/ViewFormat.h"
#include "model/CodeTables.h"
#include "model/Numeric.h"
#include "support/NumberText.h"
#include "support/Text.h"
#include "trace/PointPairs.h"

namespace zel {
namespace {

constexpr std::size_t kRows = 301;
constexpr double kIntervals = 300;
constexpr std::size_t kPair = 2;
constexpr int kMonths = 12;
constexpr int kMonthDays[kMonths] = {31, 29, 31, 30, 31, 30, 31, 31, 30, 31, 30, 31};
constexpr std::string_view kOlderLog = "END OF LOG";

/// Three whole numbers of a text, whatever stands between them; less when there are less.
std::array<int, 3> wholeNumbers(std::string_view text, std::size_t& count) {
    std::array<int, 3> numbers{};
    count = 0;
    for (const char* at = text.data(); at < text.data() + text.size() && count < 3;) {
        const auto [end, error] = std::from_chars(at, text.data() + text.size(), numbers[count]);
        const bool isNumber = error == std::errc() && *at != '-';
        if (isNumber) ++count;
        at = isNumber ? end : at + 1;
    }
    return numbers;
}

std::string digits(int number, std::size_t width) {
    const std::string text = std::to_string(number);
    return std::string(width - std::min(width, text.size()), '0') + text;
}

/// One row of a table: x and one or two values.
struct Row {
    int columns = 0;
    double x = 0;
    std::array<double, kPair> values{};
};

std::string_view withoutBlanks(std::string_view field) {
    while (!field.empty() && field.front() == ' ') field.remove_prefix(1);
    while (!field.empty() && (field.back() == ' ' || field.back() == '\r')) field.remove_suffix(1);
    return field;
}

std::optional<double> plainNumber(std::string_view field) {
    field = withoutBlanks(field);
    if (startsWith(field, "+")) field.remove_prefix(1);
    double value = 0;
    const auto [end, error] = std::from_chars(field.data(), field.data() + field.size(), value);
    if (error == std::errc() && end == field.data() + field.size())
        return std::isfinite(value) ? std::optional<double>(value) : std::nullopt;
    // A file of a desk with a decimal comma.
    std::string text(field);
    const auto comma = text.find(',');
    if (comma == std::string::npos) return std::nullopt;
    text[comma] = '.';
    const auto again = std::from_chars(text.data(), text.data() + text.size(), value);
    if (again.ec != std::errc() || again.ptr != text.data() + text.size() || !std::isfinite(value))
        return std::nullopt;
    return value;
}

std::optional<Row> rowOf(std::string_view line) {
    const char head = line.empty() ? 'x' : line.front();
    const bool looksLikeNumber = (head >= '0' && head <= '9') || head == '.' || head == '-' ||
                                 head == '+' || head == ' ' || head == ',';
    if (!looksLikeNumber) return std::nullopt;
    Row row;
    for (int field = 0; field <= static_cast<int>(kPair); ++field) {
        const auto end = line.find(';');
        const std::string_view text = line.substr(0, end);
        if (field > 0 && withoutBlanks(text).empty()) break;
        const std::optional<double> number = plainNumber(text);
        if (!number) return std::nullopt;
        if (field == 0) {
            row.x = *number;
        } else {
            row.values[static_cast<std::size_t>(field) - 1] = *number;
        }
        row.columns = field;
        if (end == std::string_view::npos) break;
        line.remove_prefix(end + 1);
    }
    return row.columns > 0 ? std::optional<Row>(row) : std::nullopt;
}

/// A unit as a saved view names it: "dBm", "dBuV".
std::string savedUnit(int code) {
    const CodeRow* row = findCode(CodeTable::ReferenceUnit, code);
    return row == nullptr ? "dBm" : std::string(row->saved);
}

/// Header lines of the trace to come.
struct Header {
    bool zeroSpan = false;
    bool distance = false;
    int unit = UNITDBM;
    double rbw = 0;
    double sweepTime = 0;    // s
    double cableLength = 0;  // m
    std::string date;
    std::string time;
};

class Cutter {
  public:
    Cutter(DateOrder order, const TraceSink& sink) : order_(order), sink_(sink) {}

    /// False when the sink has had enough.
    bool line(std::string_view text) {
        if (const std::optional<Row> row = rowOf(text)) return take(*row);
        if (!rows_.x.empty() && !finish()) return false;
        if (!withoutBlanks(text).empty()) headerLine(text);
        return true;
    }

    bool finish() {
        if (rows_.x.empty()) return true;
        SpectrumTrace trace;
        trace.xUnit = header_.distance ? "m" : header_.zeroSpan ? "s" : "Hz";
        const bool linear = header_.unit == UNITV || header_.unit == UNITW;
        trace.unit = savedUnit(linear ? UNITDBM : header_.unit);
        trace.rbw = header_.rbw;
        trace.time = isoTime(header_.date, header_.time, order_);
        trace.x = std::move(rows_.x);
        trace.level.resize(trace.x.size());
        for (std::size_t i = 0; i < trace.level.size(); ++i)
            trace.level[i] = rows_.paired ? levelsOfPoint(rows_.pairs, i).high : rows_.pairs[2 * i];
        rows_ = {};
        const double whole = header_.distance ? header_.cableLength : header_.sweepTime;
        if (header_.zeroSpan)  // the file's column holds no x then
            for (std::size_t i = 0; i < trace.x.size(); ++i)
                trace.x[i] = static_cast<double>(i) * whole / kIntervals;
        for (double& level : trace.level) {
            if (!linear) break;
            if (level <= 0)
                throw std::runtime_error("a level of 0 " + unitName() +
                                         " or below has no value in dBm");
            level = header_.unit == UNITV ? VoltsToDbm(level) : WattsToDbm(level);
        }
        headerBegun_ = false;
        ++traces_;
        return sink_(trace);
    }

    int traces() const { return traces_; }

  private:
    struct Rows {
        std::vector<double> x;
        std::vector<double> pairs;  ///< two a row, the second NaN where there is none
        bool paired = false;
    };

    std::string unitName() const { return header_.unit == UNITV ? "V" : "W"; }

    bool take(const Row& row) {
        if (rows_.x.size() == kRows && !finish()) return false;
        rows_.x.push_back(row.x);
        const bool pair = row.columns > 1;
        rows_.pairs.push_back(row.values[0]);
        rows_.pairs.push_back(pair ? row.values[1] : std::numeric_limits<double>::quiet_NaN());
        rows_.paired = rows_.paired || pair;
        return true;
    }

    void headerLine(std::string_view text) {
        if (!headerBegun_) header_ = {};
        headerBegun_ = true;
        const auto end = text.find(';');
        if (end == std::string_view::npos) return;
        const std::string_view key = text.substr(0, end);
        const std::string_view value = withoutBlanks(text.substr(end + 1));
        if (key == "Date") header_.date = value;
        if (key == kTime) header_.time = value;
        if (key == "Span") header_.zeroSpan = value == kZeroSpan;
        if (key == kMeasurementType) header_.distance = value == "Fault Location";
        if (key == kSweepTime) header_.sweepTime = plainNumber(value).value_or(0);
        if (key == "Cable Length") header_.cableLength = leadingNumber(value);
        if (key == kResolutionBandwidth) header_.rbw = plainNumber(value).value_or(0);
        if (key != kReferenceUnit) return;
        for (const CodeRow& row : codeTable(CodeTable::ReferenceUnit))
            if (!row.saved.empty() && value == row.saved) header_.unit = row.code;
    }

    DateOrder order_;
    const TraceSink& sink_;
    Header header_;
    bool headerBegun_ = false;
    Rows rows_;
    int traces_ = 0;
};

}  // namespace

DateOrder dateOrderOf(std::string_view sample) {
    std::size_t count = 0;
    const std::array<int, 3> numbers = wholeNumbers(sample, count);
    if (numbers[0] == 3) return DateOrder::DayMonthYear;
    if (numbers[0] == 2) return DateOrder::MonthDayYear;
    return DateOrder::YearMonthDay;
}

std::string isoTime(std::string_view date, std::string_view time, DateOrder order) {
    std::size_t dateCount = 0;
    std::size_t timeCount = 0;
    std::array<int, 3> day = wholeNumbers(date, dateCount);
    const std::array<int, 3> clock = wholeNumbers(time, timeCount);
    if (dateCount != 3 || timeCount != 3) return "";
    constexpr int kLastDayOfMonth = 31;
    if (day[0] > kLastDayOfMonth) order = DateOrder::YearMonthDay;
    if (order == DateOrder::YearMonthDay && day[2] > kLastDayOfMonth)
        order = DateOrder::DayMonthYear;
    if (order == DateOrder::DayMonthYear) std::swap(day[0], day[2]);
    if (order == DateOrder::MonthDayYear) day = {day[2], day[0], day[1]};
    // A month past 12 was the day.
    if (order != DateOrder::YearMonthDay && day[1] > kMonths) std::swap(day[1], day[2]);
    const auto [year, month, dayOfMonth] = day;
    if (year < 1000 || year > 9999 || month < 1 || month > kMonths || dayOfMonth < 1 ||
        dayOfMonth > kMonthDays[month - 1])
        return "";
    const auto [hour, minute, second] = clock;
    if (hour > 23 || minute > 59 || second > 59) return "";
    return digits(year, 4) + "-" + digits(month, 2) + "-" + digits(dayOfMonth, 2) + "T" +
           digits(hour, 2) + ":" + digits(minute, 2) + ":" + digits(second, 2);
}

void readTraces(std::string_view text, DateOrder order, const TraceSink& sink) {
    Cutter cutter(order, sink);
    constexpr std::string_view kByteOrderMark = "\xEF\xBB\xBF";
    if (startsWith(text, kByteOrderMark)) text.remove_prefix(kByteOrderMark.size());
    while (!text.empty()) {
        const auto end = text.find_first_of("\r\n");
        const std::string_view line = text.substr(0, end);
        if (line.find(kOlderLog) != std::string_view::npos)
            throw std::runtime_error("this is a log of the older format, not a saved view");
        if (!cutter.line(line)) return;
        if (end == std::string_view::npos) break;
        const bool pair = text.substr(end, 2) == kCrLf;
        text.remove_prefix(end + (pair ? 2 : 1));
    }
    if (!cutter.finish()) return;
    if (cutter.traces() == 0) throw std::runtime_error("no trace was found in the file");
}

}  // namespace zel
