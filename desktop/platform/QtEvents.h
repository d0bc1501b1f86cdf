#pragma once
// The event loop over Qt's, with a short way for answers that come within microseconds.

#include <QTimer>
#include <cstdint>
#include <functional>
#include <map>
#include <memory>

#include "desktop/platform/ArrivalSources.h"
#include "platform/Clock.h"
#include "platform/Events.h"

namespace zel {

class QtEvents : public Events, public ArrivalSources {
  public:
    explicit QtEvents(const Clock& clock);
    ~QtEvents() override;

    void pump() override;
    void wait(int ms) override;
    void sleep(int ms) override;
    TaskId schedule(double ms, std::function<void()> task) override;
    void cancel(TaskId id) override;

    int addSource(Source source) override;
    void removeSource(int id) override;
    void bytesArrived(int id) override;
    void bytesTaken() override { offered_ = false; }
    /// A descriptor that ends a delay as soon as it can be read; -1 for none.
    void setWakeDescriptor(int descriptor) { wakeDescriptor_ = descriptor; }

  private:
    struct Watched {
        Source source;
        bool arrived = false;  ///< since the last wait that ended for it
    };
    enum class Poll { Ready, Silent, NothingToPoll };

    bool takeArrivals();
    Poll pollSources(int ms);
    bool processEvents();
    void processAndWait(int ms);

    const Clock& clock_;
    std::map<int, Watched> sources_;
    int lastSource_ = 0;
    std::map<TaskId, std::unique_ptr<QTimer>> tasks_;
    TaskId lastTask_ = 0;
    std::unique_ptr<QTimer> waitTimer_;
    int wakeDescriptor_ = -1;
    std::int64_t lastProcessed_ = 0;  // microseconds
    bool offered_ = false;            ///< a wait ended for bytes that were not taken yet
};

}  // namespace zel
