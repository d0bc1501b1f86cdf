#pragma once
// The signals of the operating system that ask a program to end.

#include <signal.h>

#include <QSocketNotifier>
#include <csignal>
#include <map>
#include <memory>

#include "platform/Signals.h"

namespace zel {

/// SIGINT, SIGTERM and SIGHUP become an event of the loop for as long as it lives. A closed pipe
/// and a file at its size limit end no program any more: the write fails, and whoever writes
/// reports it. There is one such object at a time.
class QtSignals : public Signals {
  public:
    QtSignals();
    ~QtSignals() override;
    QtSignals(const QtSignals&) = delete;
    QtSignals& operator=(const QtSignals&) = delete;

    /// Readable from the arrival of a signal until it was delivered; -1 when there is none.
    int descriptor() const { return readEnd_; }
    /// Reports the signals that have come. The event loop does it as well.
    void deliver();

  private:
    int readEnd_ = -1;
    std::unique_ptr<QSocketNotifier> notifier_;
    std::map<int, struct sigaction> before_;
};

}  // namespace zel
