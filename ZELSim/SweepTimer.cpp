#include "ZELSim/SweepTimer.h"

#include <cmath>
#include <cstdint>
#include <limits>
#include <optional>

namespace zelsim {
namespace {

// A moment counts as reached from here on, so that sums of durations do not miss it.
constexpr double kSlack = 1e-7;
// Sweeps or looks for a trigger that one call follows singly; what lies further back is skipped.
constexpr int kMostSteps = 2000;

}  // namespace

void SweepTimer::start(double now, double length, bool free) {
    length_ = length;
    free_ = free;
    finished_ = 0;
    arm(now);
}

void SweepTimer::arm(double from) {
    began_ = from;
    state_ = free_ ? State::Running : State::Armed;
}

void SweepTimer::finish(std::uint64_t sweeps) {
    finished_ += sweeps;
    finishedInAll_ += sweeps;
}

void SweepTimer::advanceTo(double now) {
    for (int step = 0; step < kMostSteps && state_ != State::Idle; ++step) {
        if (state_ == State::Armed) {
            if (began_ > now + kSlack) {
                return;
            }
            double until = began_;
            if (const auto at = trigger_(began_, until)) {
                began_ = *at;
                state_ = State::Running;
            } else if (until <= now + kSlack) {
                began_ = until;
            } else {
                return;
            }
            continue;
        }
        const double passed = now + kSlack - began_;
        if (passed < length_) {
            return;
        }
        if (!continuous_) {
            newestStart_ = began_;
            finish(1);
            state_ = State::Idle;
        } else if (free_) {
            const double sweeps = std::floor(passed / length_);
            newestStart_ = began_ + (sweeps - 1) * length_;
            began_ += sweeps * length_;
            finish(static_cast<std::uint64_t>(sweeps));
        } else {
            newestStart_ = began_;
            finish(1);
            arm(began_ + length_);
        }
    }
    if (state_ != State::Idle && began_ < now - length_) {
        arm(now);
    }
}

std::optional<double> SweepTimer::nextEvent() const {
    if (state_ == State::Running) {
        return began_ + length_;
    }
    if (state_ == State::Armed) {
        double until = began_;
        if (const auto at = trigger_(began_, until)) {
            return *at + length_;
        }
        if (until < std::numeric_limits<double>::infinity()) {
            return until;
        }
    }
    return std::nullopt;
}

}  // namespace zelsim
