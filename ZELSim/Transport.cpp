#include "ZELSim/Transport.h"

#include <poll.h>
#include <signal.h>
#include <sys/types.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <chrono>
#include <cmath>
#include <csignal>
#include <cstddef>
#include <ctime>
#include <optional>

#include "ZELSim/HostLine.h"

namespace zelsim {
namespace {

using SteadyClock = std::chrono::steady_clock;

constexpr long kAwayNanos = 50'000'000;  // between two looks at a terminal that nobody has open
constexpr std::size_t kReadSize = 4096;
constexpr std::size_t kMostPending = 65536;  // bytes that the host has not taken yet

volatile std::sig_atomic_t endAsked = 0;

void askEnd(int) { endAsked = 1; }

class Loop {
  public:
    Loop(HostLine& wire, Endpoint& endpoint)
        : wire_(wire), endpoint_(endpoint), seen_(SteadyClock::now()) {
        sigprocmask(SIG_SETMASK, nullptr, &whileWaiting_);
        for (const int ending : {SIGINT, SIGTERM, SIGHUP}) {
            sigdelset(&whileWaiting_, ending);
        }
    }

    bool run() {
        while (endAsked == 0) {
            catchUp();
            pending_ += wire_.take();
            send();
            if (!wait()) {
                return false;
            }
        }
        return true;
    }

  private:
    void catchUp() {
        const auto now = SteadyClock::now();
        wire_.advance(std::chrono::duration<double>(now - seen_).count());
        seen_ = now;
    }

    void send() {
        const int line = endpoint_.line();
        if (line < 0) {
            pending_.clear();
            return;
        }
        std::size_t sent = 0;
        while (sent < pending_.size()) {
            const ssize_t count = write(line, pending_.data() + sent, pending_.size() - sent);
            if (count > 0) {
                sent += static_cast<std::size_t>(count);
            } else if (count < 0 && errno == EINTR) {
                continue;
            } else {
                break;
            }
        }
        const bool broken = sent < pending_.size() && errno != EAGAIN && errno != EWOULDBLOCK;
        pending_.erase(0, sent);
        if (broken) {
            hangUp();
        }
    }

    void hangUp() {
        // A terminal that nobody has open says so until somebody opens it.
        away_ = true;
        endpoint_.lost();
        wire_.reset();
        pending_.clear();
    }

    std::optional<timespec> patience() const {
        const auto due = wire_.nextDue();
        if (!due || endpoint_.line() < 0) {
            return std::nullopt;
        }
        // Never woken a little too early: rounded up to the next microsecond.
        const double micros = std::ceil(std::min(*due, 3600.0) * 1e6);
        const auto whole = static_cast<long>(micros);
        return timespec{whole / 1000000, whole % 1000000 * 1000};
    }

    bool wait() {
        std::array<pollfd, 2> watched{};
        const bool mayRead = !wire_.congested() && pending_.size() < kMostPending;
        watched[0].fd = away_ ? -1 : endpoint_.line();
        watched[0].events =
            static_cast<short>((mayRead ? POLLIN : 0) | (pending_.empty() ? 0 : POLLOUT));
        watched[1].fd = endpoint_.door();
        watched[1].events = POLLIN;
        const std::optional<timespec> limit =
            away_ && endpoint_.line() >= 0 ? std::optional(timespec{0, kAwayNanos}) : patience();
        away_ = false;
        const int count =
            ppoll(watched.data(), watched.size(), limit ? &*limit : nullptr, &whileWaiting_);
        if (count < 0) {
            return errno == EINTR;
        }
        if ((watched[1].revents & POLLIN) != 0 && endpoint_.admit()) {
            wire_.reset();
            pending_.clear();
        } else if ((watched[0].revents & (POLLIN | POLLHUP | POLLERR)) != 0) {
            receive();
        }
        return true;
    }

    void receive() {
        std::array<char, kReadSize> room{};
        const ssize_t count = read(endpoint_.line(), room.data(), room.size());
        if (count > 0) {
            catchUp();
            wire_.setHostBaud(endpoint_.hostBaud());
            wire_.receive({room.data(), static_cast<std::size_t>(count)});
        } else if (count == 0 || (errno != EAGAIN && errno != EINTR)) {
            hangUp();
        }
    }

    HostLine& wire_;
    Endpoint& endpoint_;
    SteadyClock::time_point seen_;
    sigset_t whileWaiting_{};
    std::string pending_;
    bool away_ = false;
};

}  // namespace

void catchEndSignals() {
    struct sigaction action {};
    action.sa_handler = askEnd;
    sigset_t blocked;
    sigemptyset(&blocked);
    for (const int ending : {SIGINT, SIGTERM, SIGHUP}) {
        sigaction(ending, &action, nullptr);
        sigaddset(&blocked, ending);
    }
    sigprocmask(SIG_BLOCK, &blocked, nullptr);
    struct sigaction ignored {};
    ignored.sa_handler = SIG_IGN;
    sigaction(SIGPIPE, &ignored, nullptr);
}

bool serve(HostLine& wire, Endpoint& endpoint) { return Loop(wire, endpoint).run(); }

}  // namespace zelsim
