#include "desktop/platform/QtClock.h"

#include <chrono>
#include <ctime>

namespace zel {

std::int64_t QtClock::micros() const {
    const auto now = std::chrono::steady_clock::now().time_since_epoch();
    return std::chrono::duration_cast<std::chrono::microseconds>(now).count();
}

double QtClock::date() const {
    using namespace std::chrono;
    constexpr sys_days kOrigin = year(1899) / 12 / 30;
    constexpr double kDaySeconds = 86400;
    const auto now = system_clock::now();
    const std::time_t whole = system_clock::to_time_t(floor<seconds>(now));
    std::tm local{};
    localtime_r(&whole, &local);
    const sys_days today = year(local.tm_year + 1900) / (local.tm_mon + 1) / local.tm_mday;
    const double second = local.tm_hour * 3600 + local.tm_min * 60 + local.tm_sec +
                          duration<double>(now - floor<seconds>(now)).count();
    return static_cast<double>((today - kOrigin).count()) + second / kDaySeconds;
}

}  // namespace zel
