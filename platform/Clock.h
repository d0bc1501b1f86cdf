#pragma once
// Time: a monotonic clock, the local date and time, and the millisecond stopwatch over them.

#include <cmath>
#include <cstdint>
#include <string>

namespace zel {

/// "23:59:59" of a second of the day.
std::string clockText(int secondOfDay);

class Clock {
  public:
    virtual ~Clock() = default;
    /// Microseconds since some fixed moment; never goes back.
    virtual std::int64_t micros() const = 0;
    /// Local date and time in days since 1899-12-30, the time of day in the fraction.
    virtual double date() const = 0;
    /// The day of a date as a text, "2026-01-31" unless the platform has its own way.
    virtual std::string dateText(double date) const;
    /// The time of day of a date as a text, "23:59:59".
    virtual std::string timeText(double date) const;

    /// Day and time of day.
    std::string dateTimeText(double date) const { return dateText(date) + " " + timeText(date); }

    /// Seconds since midnight, local time.
    double secondsOfDay() const {
        const double today = date();
        return (today - std::floor(today)) * 86400.0;
    }
};

/// Milliseconds since the last `Reset`.
class Stopwatch {
  public:
    explicit Stopwatch(const Clock& clock) : clock_(clock), start_(clock.micros()) {}
    void Reset() { start_ = clock_.micros(); }
    std::int32_t Elapsed() const {
        return static_cast<std::int32_t>((clock_.micros() - start_) / 1000);
    }

  private:
    const Clock& clock_;
    std::int64_t start_;
};

}  // namespace zel
