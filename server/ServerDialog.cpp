#include "server/ServerDialog.h"

#include <cstddef>
#include <initializer_list>
#include <string>
#include <utility>
#include <vector>

#include "forms/Forms.h"
#include "link/RS232Ops.h"
#include "platform/Controls.h"
#include "platform/Form.h"
#include "platform/MessageBox.h"
#include "platform/Pointer.h"
#include "platform/ServerSocket.h"
#include "platform/Session.h"
#include "server/ServerBridge.h"
#include "support/NumberText.h"
#include "support/RootDebug.h"
#include "support/Text.h"
#include "support/TimeText.h"

namespace zel {
namespace {

constexpr const char* kComponent = "ServerForm";
constexpr const char* kClass = "ServerDialog";
constexpr const char* kSection = "ServerForm";
constexpr const char* kBauds[] = {"9600", "19200", "38400", "57600", "115200"};
constexpr int kRetryMs = 10'000;
constexpr std::size_t kMostEvents = 200;

/// A list's entry by the text of its index; the first when nothing is stored, none for a number
/// outside the list. A name that was typed stands beside the index.
void selectStored(DropDownList& list, const std::string& index, const std::string& typed) {
    const double number = leadingNumber(index);
    const bool inside = number >= 0 && number < list.ListCount();
    list.setListIndex(index.empty() ? 0 : inside ? static_cast<int>(number) : -1);
    if (!typed.empty()) list.setText(typed);
}

std::string typedText(const DropDownList& list) {
    return list.ListIndex() < 0 ? list.Text() : std::string();
}

}  // namespace

ServerDialog::ServerDialog(Forms& forms, ServerBridge& bridge, const ServerSocket& TCPSocket,
                           const Services& means, const Session& services, RootDebug& log)
    : panel_(forms.controller),
      form_(forms.server),
      bridge_(bridge),
      socket_(TCPSocket),
      means_(means),
      services_(services),
      log_(log) {
    form_.chkBaudRate.setValue(true);
    form_.localIPTextBox.Locked = true;
    form_.txtClientIP.Locked = true;
    form_.txtDebug.Locked = true;
    bridge_.showState();
    handlers_.on(form_.Load, [this] { Form_Load(); });
    handlers_.on(form_.QueryUnload, [this](int& cancel) { Form_QueryUnload(cancel); });
    // The only field that can be changed while a client is at work: it counts at once.
    handlers_.on(form_.chkKeep.Clicked, [this] { saveKeep(); });
    handlers_.on(form_.cmdConnect.Clicked, [this] { cmdConnect_Click(); });
    handlers_.on(form_.cmdCancel.Clicked, [this] { cmdCancel_Click(); });
    handlers_.on(form_.cmdDisconnectClient.Clicked, [this] { bridge_.disconnectClient(); });
    handlers_.on(form_.cmdCopyAddress.Clicked, [this] {
        means_.clipboard.setText(form_.localIPTextBox.Text.get() + ":" +
                                 form_.localPortTextBox.Text.get());
    });
    handlers_.on(bridge_.Happened, [this](const std::string& text) { note(text); });
    handlers_.on(bridge_.Lost, [this] { lost(); });
}

ServerDialog::~ServerDialog() { services_.events.cancel(retry_); }

bool ServerDialog::serverWord() const {
    return upperCase(panel_.CommandLine).find("SERVER") != std::string::npos;
}

void ServerDialog::note(const std::string& text) {
    const CallScope call(log_, kComponent, kClass, "note");
    std::vector<std::string> events = form_.lstEvents.Items.get();
    events.insert(events.begin(), timeOfDayText(services_.clock.date()) + "  " + text);
    if (events.size() > kMostEvents) events.resize(kMostEvents);
    form_.lstEvents.Items = std::move(events);
}

void ServerDialog::fillFields() {
    const CallScope call(log_, kComponent, kClass, "fillFields");
    // Server mode writes its log, with the times.
    log_.FileLogEnabled = log_.FileTimeStamping = true;
    form_.cmdConnect.Caption = "connect";
    form_.cmdCancel.Caption = "cancel";
    form_.localIPTextBox.Text = socket_.localIP();
    form_.CommPorts.clear();
    ReadSerialPortNames(means_.ports, form_.CommPorts);
    form_.COMList.setItems(form_.CommPorts);
    if (form_.BaudList.ListCount() == 0)
        for (const char* baud : kBauds) form_.BaudList.AddItem(baud);
    loadSettings();
}

void ServerDialog::Form_Load() {
    const CallScope call(log_, kComponent, kClass, "Form_Load");
    // What was on the panel stays known while the server runs on with its window closed.
    form_.SavedCaption = panel_.Caption;
    fillFields();
    bridge_.showState();
    // A server that starts with the machine needs no operator.
    if (panel_.UtilityStartup.Checked)
        services_.events.schedule(0, [this] {
            if (form_.Visible && !bridge_.bridging()) cmdConnect_Click();
        });
}

void ServerDialog::loadSettings() {
    const CallScope call(log_, kComponent, kClass, "loadSettings");
    const auto get = [&](const char* key, const char* fallback) {
        return means_.settings.get(kProgramTitle, kSection, key, fallback);
    };
    form_.localPortTextBox.Text = get("LocalTCPPort", "2277");
    selectStored(form_.COMList, get("COMPort", ""), get("COMPortName", ""));
    selectStored(form_.BaudList, get("BaudRate", ""), get("BaudRateTyped", ""));
    form_.chkBaudRate.setValue(get("AutoBaud", "1") != "0");
    form_.txtAllowed.Text = get("AllowedNetworks", "");
    form_.chkKeep.setValue(get("KeepClient", "0") == "1");
}

void ServerDialog::saveKeep() {
    const CallScope call(log_, kComponent, kClass, "saveKeep");
    means_.settings.set(kProgramTitle, kSection, "KeepClient", form_.chkKeep.Value() ? "1" : "0");
}

void ServerDialog::saveSettings() {
    const CallScope call(log_, kComponent, kClass, "saveSettings");
    const auto set = [&](const char* key, const std::string& value) {
        means_.settings.set(kProgramTitle, kSection, key, value);
    };
    set("LocalTCPPort", form_.localPortTextBox.Text);
    set("COMPort", std::to_string(form_.COMList.ListIndex()));
    set("COMPortName", typedText(form_.COMList));
    set("BaudRate", std::to_string(form_.BaudList.ListIndex()));
    set("BaudRateTyped", typedText(form_.BaudList));
    set("AutoBaud", form_.chkBaudRate.Value() ? "1" : "0");
    set("AllowedNetworks", form_.txtAllowed.Text);
    saveKeep();
}

void ServerDialog::bridgingLook(bool bridging) {
    const CallScope call(log_, kComponent, kClass, "bridgingLook");
    form_.cmdCancel.Caption = bridging ? "disconnect" : "cancel";
    form_.cmdConnect.Enabled = !bridging;
    for (Control* field :
         std::initializer_list<Control*>{&form_.localPortTextBox, &form_.COMList, &form_.BaudList,
                                         &form_.chkBaudRate, &form_.txtAllowed})
        field->Enabled = !bridging;
    bridge_.showState();
}

void ServerDialog::cmdConnect_Click() {
    const CallScope call(log_, kComponent, kClass, "cmdConnect_Click");
    services_.events.cancel(retry_);
    retry_ = 0;
    form_.cmdConnect.Enabled = false;
    form_.MousePointer = kHourglass;
    const bool ok = bridge_.connect();
    form_.MousePointer = kArrow;
    bridgingLook(ok);
    if (ok) saveSettings();
}

void ServerDialog::cmdCancel_Click() {
    const CallScope call(log_, kComponent, kClass, "cmdCancel_Click");
    services_.events.cancel(retry_);
    retry_ = 0;
    if (bridge_.bridging()) {
        bridge_.disconnect();
        bridgingLook(false);
        return;
    }
    int cancel = 0;
    form_.QueryUnload(cancel);
    if (cancel != 0) return;
    form_.Hide();
    form_.unload(1);
}

void ServerDialog::Form_QueryUnload(int& cancel) {
    const CallScope call(log_, kComponent, kClass, "Form_QueryUnload");
    const BoxAnswer answer =
        services_.boxes.show({BoxIcon::Question,
                              std::string("Are you sure you want to close ZELRemote Server") +
                                  kCrLf + "and disconnect client computer?",
                              kProgramTitle, BoxButtons::YesNo});
    if (answer == BoxAnswer::No) {
        cancel = -1;
        return;
    }
    services_.events.cancel(retry_);
    retry_ = 0;
    bridge_.disconnect();
    bridgingLook(false);
    // With the word the program ends with its only window.
    if (!serverWord()) panel_.Caption = form_.SavedCaption;
}

void ServerDialog::lost() {
    const CallScope call(log_, kComponent, kClass, "lost");
    bridgingLook(false);
    if (panel_.UtilityStartup.Checked) {
        retry_ = services_.events.schedule(kRetryMs, [this] { tryAgain(); });
        showRetry();
        return;
    }
    services_.boxes.show({BoxIcon::Warning, bridge_.problem()});
}

void ServerDialog::showRetry() {
    const CallScope call(log_, kComponent, kClass, "showRetry");
    form_.txtDebug.Text = "Tried again every 10 s. " + replaceAll(bridge_.problem(), kCrLf, " ");
}

// Nobody may be there to close a box, so that a failed try is only written down.
void ServerDialog::tryAgain() {
    const CallScope call(log_, kComponent, kClass, "tryAgain");
    retry_ = 0;
    if (bridge_.bridging() || bridge_.connecting()) return;
    const bool ok = bridge_.connect(true);
    bridgingLook(ok);
    if (ok) {
        form_.txtDebug.Text = "";
        return;
    }
    retry_ = services_.events.schedule(kRetryMs, [this] { tryAgain(); });
    showRetry();
}

}  // namespace zel
