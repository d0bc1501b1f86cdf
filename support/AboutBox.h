#pragma once
// The window about the program: its title and version, and the support report.

#include <optional>
#include <string>

#include "forms/SupportForms.h"
#include "platform/Clock.h"
#include "platform/Event.h"
#include "platform/Events.h"
#include "platform/Files.h"
#include "platform/Machine.h"
#include "platform/MessageBox.h"
#include "platform/Services.h"
#include "support/DriverFolders.h"
#include "support/SupportReport.h"
#include "support/cRegistry.h"

namespace zel {

class AboutBox {
  public:
    struct Services {
        Machine& machine;
        FileService& files;
        const Clock& clock;
        Clipboard& clipboard;
        Launcher& launcher;
        MessageBoxes& boxes;
        Events& events;
    };
    /// `registryFile` stands for the machine's registry.
    AboutBox(AboutForm& form, const Services& services, const std::string& registryFile);
    AboutBox(const AboutBox&) = delete;
    AboutBox& operator=(const AboutBox&) = delete;

    ~AboutBox();

    /// Shows the window modally; comes back when it is closed.
    void show();

  private:
    void load();
    void fill();
    void awaitFolders();
    void stopWaiting();
    void CreateSupportString_Click();
    void StartNISpy_Click();
    std::string spyText(const std::string& section, const std::string& name);
    void writeSpy(const std::string& name, const std::string& value);

    AboutForm& form_;
    Services s_;
    cRegistry registry_;
    std::optional<DriverFolders> folders_;  ///< of the report that is shown
    SupportReport report_;
    TaskId task_ = 0;
    Handlers handlers_;
};

}  // namespace zel
