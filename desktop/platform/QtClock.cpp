#include "desktop/platform/QtClock.h"

#include <QDateTime>
#include <chrono>

namespace zel {

std::int64_t QtClock::micros() const {
    const auto now = std::chrono::steady_clock::now().time_since_epoch();
    return std::chrono::duration_cast<std::chrono::microseconds>(now).count();
}

double QtClock::date() const {
    static const QDate origin(1899, 12, 30);
    const QDateTime now = QDateTime::currentDateTime();
    constexpr double kDayMs = 86400000.0;
    return static_cast<double>(origin.daysTo(now.date())) +
           now.time().msecsSinceStartOfDay() / kDayMs;
}

}  // namespace zel
