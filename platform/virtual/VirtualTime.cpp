#include "platform/virtual/VirtualTime.h"

#include <algorithm>
#include <chrono>
#include <cmath>
#include <cstdint>
#include <functional>
#include <utility>
#include <vector>

#include "platform/Events.h"

namespace zel {
namespace {

constexpr double kMicrosPerDay = 86400.0 * 1e6;
/// Longest time ahead that a task may have: a hundred years.
constexpr double kMaxAheadMs = 100.0 * 365.25 * 86400.0 * 1000.0;

std::int64_t microsOf(double ms) {
    if (!(ms > 0)) return 0;
    return std::llround(std::min(ms, kMaxAheadMs) * 1000.0);
}

}  // namespace

double dateOf(int year, int month, int day, int hour, int minute, double second) {
    using namespace std::chrono;
    const sys_days when{std::chrono::year(year) / month / day};
    const sys_days zero{std::chrono::year(1899) / 12 / 30};
    const double time = hour * 3600.0 + minute * 60.0 + second;
    return static_cast<double>((when - zero).count()) + time / 86400.0;
}

VirtualClock::VirtualClock() : VirtualClock(dateOf(2026, 1, 1, 12)) {}

double VirtualClock::date() const {
    return startDate_ + static_cast<double>(micros_) / kMicrosPerDay;
}

void VirtualClock::setDate(double date) {
    startDate_ = date - static_cast<double>(micros_) / kMicrosPerDay;
}

void VirtualClock::advanceMicros(std::int64_t micros) {
    micros_ += std::max<std::int64_t>(micros, 0);
}

void VirtualClock::advance(double ms) { advanceMicros(microsOf(ms)); }

void VirtualEvents::wait(int ms) {
    if (runDue()) return;
    const std::int64_t end = clock_.micros() + microsOf(ms);
    if (tasks_.empty() || tasks_.begin()->first.first > end) {
        clock_.advanceMicros(end - clock_.micros());
        return;
    }
    clock_.advanceMicros(tasks_.begin()->first.first - clock_.micros());
    runDue();
}

void VirtualEvents::sleep(int ms) { clock_.advance(ms); }

TaskId VirtualEvents::schedule(double ms, std::function<void()> task) {
    const TaskId id = ++lastId_;
    // One microsecond at least for a task that a task schedules: time goes on even where one
    // schedules itself at 0 ms for ever.
    const std::int64_t ahead = std::max<std::int64_t>(microsOf(ms), running_ > 0 ? 1 : 0);
    const std::int64_t when = clock_.micros() + ahead;
    tasks_.emplace(Key{when, id}, std::move(task));
    due_.emplace(id, when);
    return id;
}

void VirtualEvents::cancel(TaskId id) {
    const auto found = due_.find(id);
    if (found == due_.end()) return;
    tasks_.erase(Key{found->second, id});
    due_.erase(found);
}

void VirtualEvents::runFor(double ms) {
    const std::int64_t end = clock_.micros() + microsOf(ms);
    pump();
    while (clock_.micros() < end) {
        const std::int64_t next = tasks_.empty() ? end : tasks_.begin()->first.first;
        clock_.advanceMicros(std::min(next, end) - clock_.micros());
        pump();
    }
}

bool VirtualEvents::runDue() {
    const std::int64_t now = clock_.micros();
    std::vector<Key> due;
    for (const auto& [key, task] : tasks_) {
        if (key.first > now) break;
        due.push_back(key);
    }
    bool ran = false;
    for (const Key& key : due) {
        const auto found = tasks_.find(key);  // a task before may have cancelled or run it
        if (found == tasks_.end()) continue;
        const std::function<void()> task = std::move(found->second);
        tasks_.erase(found);
        due_.erase(key.second);
        ++running_;
        task();
        --running_;
        ran = true;
    }
    return ran;
}

}  // namespace zel
