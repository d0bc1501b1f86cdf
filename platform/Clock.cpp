#include "platform/Clock.h"

#include <array>
#include <chrono>
#include <cstdio>

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

}  // namespace

std::string Clock::dateText(double date) const {
    using namespace std::chrono;
    const year_month_day day = sys_days(year(1899) / 12 / 30) + days(daysAndSeconds(date).first);
    std::array<char, 16> text{};
    std::snprintf(text.data(), text.size(), "%04d-%02u-%02u", static_cast<int>(day.year()),
                  static_cast<unsigned>(day.month()), static_cast<unsigned>(day.day()));
    return text.data();
}

std::string Clock::timeText(double date) const {
    const int second = daysAndSeconds(date).second;
    std::array<char, 16> text{};
    std::snprintf(text.data(), text.size(), "%02d:%02d:%02d", second / 3600, second / 60 % 60,
                  second % 60);
    return text.data();
}

}  // namespace zel
