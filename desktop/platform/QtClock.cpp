#include "desktop/platform/QtClock.h"

#include <QDateTime>
#include <QLocale>
#include <chrono>
#include <cmath>
#include <cstdint>
#include <ctime>
#include <string>
#include <utility>

namespace zel {

std::int64_t QtClock::micros() const {
    const auto now = std::chrono::steady_clock::now().time_since_epoch();
    return std::chrono::duration_cast<std::chrono::microseconds>(now).count();
}

namespace {

const QDate kFirstDay(1899, 12, 30);
constexpr double kDayMilliseconds = 86400000;

}  // namespace

std::string QtClock::dateText(double date) const {
    // Each sweep asks for the date of the same day; to ask the system for its form takes long.
    thread_local std::pair<double, std::string> last{NAN, ""};
    const double today = std::floor(date);
    if (last.first == today) return last.second;
    const QLocale locale = QLocale::system();
    QString format = locale.dateFormat(QLocale::ShortFormat);
    if (!format.contains("yyyy")) format.replace("yy", "yyyy");
    const QDate day = kFirstDay.addDays(static_cast<qint64>(today));
    last = {today, locale.toString(day, format).toStdString()};
    return last.second;
}

std::string QtClock::timeText(double date) const {
    const auto ms = static_cast<int>((date - std::floor(date)) * kDayMilliseconds);
    const QTime time = QTime::fromMSecsSinceStartOfDay(ms);
    // The short form of most locales leaves the seconds out.
    return time.toString("HH:mm:ss").toStdString();
}

double QtClock::dateOf(std::time_t seconds, double fraction) {
    using namespace std::chrono;
    constexpr sys_days kOrigin = year(1899) / 12 / 30;
    constexpr double kDaySeconds = 86400;
    std::tm local{};
    localtime_r(&seconds, &local);
    const sys_days day = year(local.tm_year + 1900) / (local.tm_mon + 1) / local.tm_mday;
    const double second = local.tm_hour * 3600 + local.tm_min * 60 + local.tm_sec + fraction;
    return static_cast<double>((day - kOrigin).count()) + second / kDaySeconds;
}

double QtClock::date() const {
    using namespace std::chrono;
    const auto now = system_clock::now();
    const auto whole = floor<seconds>(now);
    return dateOf(system_clock::to_time_t(whole), duration<double>(now - whole).count());
}

}  // namespace zel
