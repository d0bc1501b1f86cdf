#include "shell/StartUp.h"

#include "connection/Profiles.h"
#include "forms/Forms.h"
#include "forms/MainForm.h"
#include "model/ZEL3Variables.h"
#include "panel/SoftPanel.h"
#include "platform/Form.h"
#include "shell/ServerMode.h"
#include "support/CommandWord.h"
#include "support/TimeText.h"
#include "support/VersionInfo.h"
#include "trace/GraphInteraction.h"

namespace zel {
namespace {

constexpr Color k3DKey = 0xE0E0E0;

}  // namespace

StartUp::StartUp(Forms& forms, const ZEL3Variables& mirror, SoftPanel& softPanel,
                 GraphInteraction& graph, ServerMode& server, const Services& services)
    : forms_(forms),
      panel_(forms.controller),
      mirror_(mirror),
      softPanel_(softPanel),
      graph_(graph),
      server_(server),
      services_(services) {}

bool StartUp::Form_Load(const VersionInfo& version) {
    panel_.TimeLabel.Caption = timeOfDayText(services_.clock.date());
    panel_.UpNow.Enabled = true;
    panel_.State = 0;
    panel_.InstrumentMode = ControllerForm::ANALYZER;
    panel_.YVectorVal = 0;
    panel_.LastSpan = mirror_.Span;
    panel_.GetOption.setValue(true);
    panel_.mLoadOption = services_.settings.get(kProgramName, "Properties", "Option", "");
    if (panel_.mLoadOption.empty()) panel_.mLoadOption = "R";
    panel_.ConnectedPic.Visible = false;
    graph_.setUpCursors();
    softPanel_.setKeyCaptions(ControllerForm::Freq);
    softPanel_.SetTextFieldsAndFrames(ControllerForm::Freq);
    softPanel_.SetSoftButtonsColor(0);
    softPanel_.SetButtonsStatus(ControllerForm::Freq);
    panel_.SaveCurrentView.Enabled = false;
    panel_.RecordData.Enabled = false;
    panel_.cmd3D.BackColor = k3DKey;
    hideUnused();
    if (testCommandWord(panel_, "BUTTON")) panel_.ImmConnect.Visible = true;
    panel_.Caption = "Marlow & Tenby ZELRemote v" + versionText(version);
    const bool serverMode = testCommandWord(panel_, "SERVER");
    panel_.UtilityStartup.Checked = serverMode;
    if (serverMode) {
        server_.UtilityServer_Click();
        return false;
    }
    graph_.finishCursors();
    panel_.Show();
    return true;
}

void StartUp::hideUnused() {
    panel_.ImmConnect.Visible = false;
    panel_.Picture3.Visible = false;
    panel_.StopButton.Visible = false;
    panel_.Disconnect.Enabled = false;
    panel_.DebugTextBox.Locked = true;
    panel_.ManualCommandTextAnsw.Locked = true;
    MainForm& dialog = forms_.main;
    dialog.OnPic.Visible = false;
    dialog.CancelButton.Visible = false;
    dialog.IDText.Locked = true;
    dialog.AirBaudRateText.Locked = true;
    forms_.tcpConnection.IDTextBox.Locked = true;
}

}  // namespace zel
