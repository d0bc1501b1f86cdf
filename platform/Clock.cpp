#include "platform/Clock.h"

#include <chrono>
#include <cmath>
#include <cstddef>
#include <string>
#include <utility>

namespace zel {
namespace {

constexpr int kDaySeconds = 86400;
constexpr double kMostDays = 2958465;  // the last day of the year 9999

/// Whole days since 1899-12-30 and the second of the day, the nearest one.
std::pair<int, int> daysAndSeconds(double date) {
    if (!(date > 0)) date = 0;
    if (date > kMostDays) date = kMostDays;
    int days = static_cast<int>(date);
    int second = static_cast<int>(std::lround((date - days) * kDaySeconds));
    if (second == kDaySeconds) ++days, second = 0;
    return {days, second};
}

/// With zeros in front, up to the width.
std::string padded(int number, std::size_t width) {
    std::string text = std::to_string(number);
    if (text.size() < width) text.insert(0, width - text.size(), '0');
    return text;
}

}  // namespace

std::string clockText(int secondOfDay) {
    return padded(secondOfDay / 3600, 2) + ":" + padded(secondOfDay / 60 % 60, 2) + ":" +
           padded(secondOfDay % 60, 2);
}

std::string Clock::dateText(double date) const {
    using namespace std::chrono;
    const year_month_day day = sys_days(year(1899) / 12 / 30) + days(daysAndSeconds(date).first);
    return padded(static_cast<int>(day.year()), 4) + "-" +
           padded(static_cast<int>(static_cast<unsigned>(day.month())), 2) + "-" +
           padded(static_cast<int>(static_cast<unsigned>(day.day())), 2);
}

std::string Clock::timeText(double date) const { return clockText(daysAndSeconds(date).second); }

}  // namespace zel
