#pragma once
// A list of handlers that one thing calls when something happens to it.

#include <cstddef>
#include <functional>
#include <utility>
#include <vector>

namespace zel {

/// Handlers run in the order of connection, on the caller's stack. A handler may connect further
/// handlers while it runs; those run from the next call on.
template <class... Args>
class Event {
  public:
    using Handler = std::function<void(Args...)>;

    void connect(Handler handler) { handlers_.push_back(std::move(handler)); }
    bool connected() const { return !handlers_.empty(); }

    void operator()(Args... args) const {
        const std::size_t count = handlers_.size();
        for (std::size_t i = 0; i < count; ++i) {
            const Handler handler = handlers_[i];  // the list may grow under us
            handler(args...);
        }
    }

  private:
    std::vector<Handler> handlers_;
};

}  // namespace zel
