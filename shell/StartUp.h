#pragma once
// What happens from the start of the program until the panel waits for the user.

#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "model/ZEL3Variables.h"
#include "panel/SoftPanel.h"
#include "platform/Clock.h"
#include "platform/Services.h"
#include "shell/ServerMode.h"
#include "support/VersionInfo.h"
#include "trace/GraphInteraction.h"

namespace zel {

class StartUp {
  public:
    struct Services {
        const Clock& clock;
        SettingsStore& settings;
    };
    StartUp(Forms& forms, const ZEL3Variables& mirror, SoftPanel& softPanel,
            GraphInteraction& graph, ServerMode& server, const Services& services);

    /// With the word "SERVER" it returns when the server's window is closed, and false: the
    /// program is at its end.
    bool Form_Load(const VersionInfo& version);

  private:
    void hideUnused();

    Forms& forms_;
    ControllerForm& panel_;
    const ZEL3Variables& mirror_;
    SoftPanel& softPanel_;
    GraphInteraction& graph_;
    ServerMode& server_;
    Services services_;
};

}  // namespace zel
