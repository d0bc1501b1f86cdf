#pragma once
// The platforms of the console: real ports over Qt, or the built-in simulator in virtual time.

#include <memory>
#include <string>

#include "platform/Clock.h"
#include "platform/Events.h"
#include "platform/MessageBox.h"
#include "platform/Platform.h"
#include "platform/Services.h"

namespace zel {

/// The toolkit's application object, which must stand before all else.
class ToolkitSession {
  public:
    ToolkitSession(int& argc, char** argv);
    ~ToolkitSession();
    ToolkitSession(const ToolkitSession&) = delete;
    ToolkitSession& operator=(const ToolkitSession&) = delete;

  private:
    struct Application;
    std::unique_ptr<Application> application_;
};

class QtSignals;

class Front {
  public:
    virtual ~Front() = default;
    virtual const Clock& clock() const = 0;
    virtual Events& events() = 0;
    /// The signals that end the program: `QtSignals` of either front.
    virtual QtSignals& endSignals() = 0;
    /// The platform with the given event loop, which stands in front of `events`.
    virtual Platform platform(Events& served, MessageBoxes& boxes, FileDialogs& dialogs) = 0;
};

/// `home` is the application's folder; empty for the user's own.
std::unique_ptr<Front> makeSimulatorFront(const std::string& home);
std::unique_ptr<Front> makePortFront(const std::string& home);

}  // namespace zel
