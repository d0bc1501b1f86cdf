#include "platform/TimerDriver.h"

#include <optional>

#include "platform/Controls.h"

namespace zel {

TimerDriver::~TimerDriver() {
    for (auto& [timer, entry] : entries_)
        if (entry.interval > 0) events_.cancel(entry.task);
}

void TimerDriver::attach(Timer& timer) {
    entries_[&timer];
    timer.Changed.connect([this, &timer] { follow(timer); });
    follow(timer);
}

void TimerDriver::follow(Timer& timer) {
    Entry& entry = entries_[&timer];
    const int wanted = timer.Enabled && timer.Interval > 0 ? timer.Interval.get() : 0;
    if (wanted == entry.interval) return;
    if (entry.interval > 0) events_.cancel(entry.task);
    entry.interval = wanted;
    if (wanted > 0) arm(timer);
}

void TimerDriver::arm(Timer& timer, std::optional<int> ms) {
    Entry& entry = entries_[&timer];
    entry.task = events_.schedule(ms.value_or(entry.interval), [this, &timer] {
        Entry& due = entries_[&timer];
        arm(timer);  // before the tick, so that a long tick keeps the pace
        if (due.inTick) {
            due.missed = true;
            return;
        }
        due.inTick = true;
        timer.Tick();
        due.inTick = false;
        if (!due.missed) return;
        // A tick that fell due meanwhile is late, not lost.
        due.missed = false;
        if (due.interval == 0) return;
        events_.cancel(due.task);
        arm(timer, 0);
    });
}

}  // namespace zel
