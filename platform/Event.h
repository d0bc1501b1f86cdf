#pragma once
// A list of handlers that one thing calls when something happens to it.

#include <algorithm>
#include <cstddef>
#include <functional>
#include <memory>
#include <utility>
#include <vector>

namespace zel {

/// Names one handler of one event. A copy names the same handler; an event that is gone has ended
/// all its handlers.
class EventHandle {
  public:
    EventHandle() = default;
    /// The handler is not called any more. A call that is running comes to its end.
    void end() {
        if (const auto flag = connected_.lock()) *flag = false;
    }
    bool connected() const {
        const auto flag = connected_.lock();
        return flag && *flag;
    }

  private:
    template <class... Args>
    friend class Event;
    explicit EventHandle(std::weak_ptr<bool> connected) : connected_(std::move(connected)) {}

    std::weak_ptr<bool> connected_;
};

/// Handlers run in the order of connection, on the caller's stack. A handler may connect further
/// handlers while it runs; those run from the next call on. A handler that was ended is not
/// called, also when the event is being called at that moment.
template <class... Args>
class Event {
  public:
    using Handler = std::function<void(Args...)>;

    EventHandle connect(Handler handler) {
        if (calls_ == 0) dropEnded();
        entries_.push_back(std::make_shared<Entry>(Entry{std::move(handler)}));
        return EventHandle(std::shared_ptr<bool>(entries_.back(), &entries_.back()->connected));
    }
    bool connected() const {
        return std::any_of(entries_.begin(), entries_.end(),
                           [](const auto& entry) { return entry->connected; });
    }

    void operator()(Args... args) const {
        const Call call(calls_);
        const std::size_t count = entries_.size();
        for (std::size_t i = 0; i < count; ++i) {
            const std::shared_ptr<Entry> entry = entries_[i];  // the list may grow under us
            if (entry->connected) entry->handler(args...);
        }
    }

  private:
    struct Entry {
        Handler handler;
        bool connected = true;
    };
    /// Counts the calls on the stack, also where a handler throws.
    class Call {
      public:
        explicit Call(int& calls) : calls_(calls) { ++calls_; }
        ~Call() { --calls_; }
        Call(const Call&) = delete;
        Call& operator=(const Call&) = delete;

      private:
        int& calls_;
    };
    void dropEnded() {
        entries_.erase(std::remove_if(entries_.begin(), entries_.end(),
                                      [](const auto& entry) { return !entry->connected; }),
                       entries_.end());
    }

    std::vector<std::shared_ptr<Entry>> entries_;
    mutable int calls_ = 0;
};

/// The handlers of one owner: they end when it goes. Declare it as the last member, so that it
/// goes before what the handlers use.
class Handlers {
  public:
    Handlers() = default;
    ~Handlers() { end(); }
    Handlers(const Handlers&) = delete;
    Handlers& operator=(const Handlers&) = delete;

    /// Connects a handler that ends with the owner.
    template <class Source, class Handler>
    EventHandle on(Source& event, Handler&& handler) {
        handles_.push_back(event.connect(std::forward<Handler>(handler)));
        return handles_.back();
    }
    void end() {
        for (EventHandle& handle : handles_) handle.end();
        handles_.clear();
    }

  private:
    std::vector<EventHandle> handles_;
};

}  // namespace zel
