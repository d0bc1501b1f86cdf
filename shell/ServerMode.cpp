#include "shell/ServerMode.h"

#include "forms/Forms.h"
#include "platform/Events.h"
#include "platform/ModalForm.h"
#include "platform/Services.h"

namespace zel {
namespace {

constexpr const char* kLinkName = "ZELRemote.lnk";

}  // namespace

ServerMode::ServerMode(Forms& forms, StartupFolder& startup, Events& events)
    : forms_(forms), panel_(forms.controller), startup_(startup), events_(events) {
    handlers_.on(panel_.UtilityServer.Clicked, [this] { UtilityServer_Click(); });
    handlers_.on(panel_.UtilityStartup.Clicked, [this] { UtilityStartup_Click(); });
}

void ServerMode::UtilityServer_Click() {
    panel_.StartT = 0;
    panel_.UpNow.Enabled = true;
    showModalForm(forms_.server, events_);
}

void ServerMode::UtilityStartup_Click() {
    if (!panel_.UtilityStartup.Checked) {
        startup_.createLink(kLinkName, "server");
        panel_.UtilityStartup.Checked = true;
    } else {
        panel_.UtilityStartup.Checked = false;
        startup_.removeLink(kLinkName);
    }
}

}  // namespace zel
