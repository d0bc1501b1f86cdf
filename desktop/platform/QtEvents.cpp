#include "desktop/platform/QtEvents.h"

#include <poll.h>

#include <QAbstractEventDispatcher>
#include <QCoreApplication>
#include <algorithm>
#include <array>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <memory>
#include <utility>

#include "platform/Clock.h"
#include "platform/Events.h"

namespace zel {
namespace {

// An answer of a fast line comes within this time; events need not run meanwhile.
constexpr int kShortWayMs = 2;
constexpr std::int64_t kPumpEveryMicros = 2000;
constexpr std::size_t kMostSources = 8;

}  // namespace

QtEvents::QtEvents(const Clock& clock) : clock_(clock), waitTimer_(std::make_unique<QTimer>()) {
    waitTimer_->setSingleShot(true);
    waitTimer_->setTimerType(Qt::PreciseTimer);
}

QtEvents::~QtEvents() = default;

int QtEvents::addSource(Source source) {
    sources_[++lastSource_] = {std::move(source)};
    return lastSource_;
}

void QtEvents::removeSource(int id) { sources_.erase(id); }

void QtEvents::bytesArrived(int id) {
    if (const auto found = sources_.find(id); found != sources_.end()) found->second.arrived = true;
}

/// Whether a buffer holds bytes that no wait has ended for.
bool QtEvents::takeArrivals() {
    bool any = false;
    for (auto& [id, watched] : sources_)
        any |= std::exchange(watched.arrived, false) && watched.source.bytesWait();
    return any;
}

QtEvents::Poll QtEvents::pollSources(int ms) {
    std::array<pollfd, kMostSources> descriptors{};
    nfds_t count = 0;
    for (const auto& [id, watched] : sources_) {
        // Who leaves bytes in the buffer waits for none: the loop goes on to fetch them, and a
        // full buffer would leave the descriptor readable for ever.
        if (watched.source.bytesWait()) continue;
        const int fd = watched.source.descriptor();
        if (fd >= 0 && count < descriptors.size())
            descriptors.at(count++) = {fd, POLLIN | POLLRDHUP, 0};
    }
    if (count == 0) return Poll::NothingToPoll;
    if (::poll(descriptors.data(), count, ms) <= 0) return Poll::Silent;
    const bool ended = std::any_of(descriptors.begin(), descriptors.end(), [](const pollfd& d) {
        return (d.revents & (POLLHUP | POLLRDHUP | POLLERR | POLLNVAL)) != 0;
    });
    // The loop has to notice the end of a line: it would be readable for ever.
    if (ended) processEvents();
    return Poll::Ready;
}

bool QtEvents::processEvents() {
    QAbstractEventDispatcher* dispatcher = QAbstractEventDispatcher::instance();
    bool any = false;
    if (dispatcher != nullptr) {
        any = dispatcher->processEvents(QEventLoop::AllEvents);
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    }
    lastProcessed_ = clock_.micros();
    return any;
}

void QtEvents::pump() {
    // The loops above pump at every turn; running the events so often would cost more than the
    // line itself.
    if (clock_.micros() - lastProcessed_ >= kPumpEveryMicros) processEvents();
}

void QtEvents::wait(int ms) {
    if (takeArrivals()) return pump();
    // What nobody takes goes from the line into the buffer, where it ends one wait at most.
    const bool left = std::exchange(offered_, false);
    const bool overdue = clock_.micros() - lastProcessed_ >= kPumpEveryMicros;
    if ((left || overdue) && processEvents()) return;
    if (takeArrivals()) return;
    const int shortWay = std::min(ms, kShortWayMs);
    const Poll polled = pollSources(shortWay);
    offered_ = polled == Poll::Ready;
    if (offered_) return;
    if (polled == Poll::NothingToPoll) return processAndWait(ms);
    if (ms > shortWay) {
        processAndWait(ms - shortWay);
    } else {
        processEvents();
    }
}

void QtEvents::processAndWait(int ms) {
    if (processEvents() || takeArrivals() || ms <= 0) return;
    waitTimer_->start(ms);
    if (QAbstractEventDispatcher* dispatcher = QAbstractEventDispatcher::instance())
        dispatcher->processEvents(QEventLoop::AllEvents | QEventLoop::WaitForMoreEvents);
    waitTimer_->stop();
    lastProcessed_ = clock_.micros();
}

void QtEvents::sleep(int ms) {
    // Nothing is served, timers included: a tick that began an exchange now would stand between
    // the two halves of another. Only the end of the program does not wait.
    const std::int64_t end = clock_.micros() + std::int64_t{ms} * 1000;
    pollfd wake{wakeDescriptor_, POLLIN, 0};
    for (;;) {
        const std::int64_t left = end - clock_.micros();
        if (left <= 0) return;
        const int woken =
            ::poll(&wake, wakeDescriptor_ < 0 ? 0 : 1, static_cast<int>((left + 999) / 1000));
        if (woken > 0) return;
    }
}

TaskId QtEvents::schedule(double ms, std::function<void()> task) {
    const TaskId id = ++lastTask_;
    auto timer = std::make_unique<QTimer>();
    timer->setSingleShot(true);
    timer->setTimerType(Qt::PreciseTimer);
    QObject::connect(timer.get(), &QTimer::timeout, timer.get(), [this, id, task] {
        const std::function<void()> run = task;  // the timer goes before the task
        if (const auto found = tasks_.find(id); found != tasks_.end()) {
            found->second.release()->deleteLater();
            tasks_.erase(found);
        }
        run();
    });
    timer->start(static_cast<int>(std::ceil(std::clamp(ms, 0.0, 2e9))));
    tasks_[id] = std::move(timer);
    return id;
}

void QtEvents::cancel(TaskId id) { tasks_.erase(id); }

}  // namespace zel
