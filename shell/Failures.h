#pragma once
// The end of the program by a failure that nothing has caught, in order.

#include <functional>

#include "platform/Event.h"
#include "shell/Logs.h"
#include "support/ErrorReport.h"

namespace zel {

class Failures {
  public:
    /// `end` closes recordings and logs, releases the port and ends the program.
    Failures(Logs& logs, ErrorReport& report, std::function<void()> end);

    /// For the exception that is being handled; call it inside a catch alone. The structured log
    /// gets its entry in a file with times, the report is shown, then the program ends.
    void handle();
    /// A failure has ended the program.
    bool failed() const { return failed_; }

  private:
    void finish();

    Logs& logs_;
    ErrorReport& report_;
    std::function<void()> end_;
    bool handling_ = false;
    bool failed_ = false;
    Handlers handlers_;
};

}  // namespace zel
