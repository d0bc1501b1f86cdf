#include "support/AboutBox.h"

#include <cstdint>
#include <string>

#include "forms/SupportForms.h"
#include "platform/Controls.h"
#include "platform/MessageBox.h"
#include "platform/ModalForm.h"
#include "support/RegAccess.h"
#include "support/SupportReport.h"
#include "support/Text.h"
#include "support/VersionInfo.h"
#include "support/cRegistry.h"

namespace zel {
namespace {

constexpr const char* kSpy = "SOFTWARE\\National Instruments\\NI Spy";
constexpr const char* kSpyOptions = "SOFTWARE\\National Instruments\\NI Spy\\Options";
constexpr const char* kSpyProgram = "NISpy.exe";
constexpr const char* kHistoryDepth = "1000";
// A disk that is slow must not hold the window: what takes longer comes when it is there.
constexpr int kLoadMs = 60;
constexpr int kLookMs = 50;
constexpr std::int64_t kCopyMicros = 3'000'000;

struct Part {
    Button AboutForm::*key;
    TextBox AboutForm::*text;
    const char* what;
};
constexpr Part kParts[] = {
    {&AboutForm::ShowSystemInfo, &AboutForm::SystemInfo, "system information"},
    {&AboutForm::ShowDriverInfo, &AboutForm::DriverInfo, "driver information"},
    {&AboutForm::ShowLegalNotes, &AboutForm::LegalNotes, "legal notes"},
};

void setShown(AboutForm& form, const Part& part, bool shown) {
    (form.*part.text).Visible = shown;
    (form.*part.key).Caption = std::string(shown ? "hide " : "show ") + part.what;
}

}  // namespace

AboutBox::AboutBox(AboutForm& form, const Services& services, const std::string& registryFile)
    : form_(form),
      s_(services),
      registry_(services.files, registryFile,
                [&machine = services.machine](const std::string& name) {
                    return machine.environment(name);
                }) {
    for (const Part& part : kParts) {
        (form_.*part.text).Locked = true;
        setShown(form_, part, false);
        handlers_.on((form_.*part.key).Clicked,
                     [this, &part] { setShown(form_, part, !(form_.*part.text).Visible); });
    }
    handlers_.on(form_.Load, [this] { load(); });
    handlers_.on(form_.CreateSupportString.Clicked, [this] { CreateSupportString_Click(); });
    handlers_.on(form_.StartNISpy.Clicked, [this] { StartNISpy_Click(); });
    handlers_.on(form_.ButtonOK.Clicked, [this] { form_.Hide(); });
}

AboutBox::~AboutBox() { stopWaiting(); }

void AboutBox::show() {
    if (form_.Visible) return;
    showModalForm(form_, s_.events);
    stopWaiting();
}

void AboutBox::stopWaiting() {
    if (task_ != 0) s_.events.cancel(task_);
    task_ = 0;
}

void AboutBox::load() {
    folders_.emplace(s_.machine, registry_);
    const bool whole = folders_->read(kLoadMs);
    fill();
    if (!whole) awaitFolders();
}

void AboutBox::awaitFolders() {
    stopWaiting();
    task_ = s_.events.schedule(kLookMs, [this] {
        task_ = 0;
        folders_->read(0) ? fill() : awaitFolders();
    });
}

void AboutBox::fill() {
    report_ = makeSupportReport({s_.machine, s_.clock, *folders_});
    form_.TitleLabel.Caption = kProgramTitle;
    form_.VersionLabel.Caption = "Version " + versionText(kVersion);
    form_.LicenceLabel.Caption =
        "Remote control of the ZEL3 family of spectrum analysers. Free software under the GNU "
        "General Public License, version 3 or later.";
    form_.SystemInfo.Text = report_.system;
    form_.DriverInfo.Text = report_.drivers;
    form_.LegalNotes.Text = report_.legal;
}

void AboutBox::CreateSupportString_Click() {
    // The text is to be whole; the window goes on meanwhile, and closing it ends the wait.
    const bool shown = form_.Visible;
    if (!folders_) load();
    form_.CreateSupportString.Enabled = false;
    const std::int64_t until = s_.clock.micros() + kCopyMicros;
    while (form_.Visible == shown && !folders_->read(kLoadMs) && s_.clock.micros() < until)
        s_.events.wait(kLookMs);
    form_.CreateSupportString.Enabled = true;
    if (form_.Visible != shown) return;
    fill();
    s_.clipboard.setText(report_.whole());
    s_.boxes.show({BoxIcon::Information,
                   "Support information copied to clipboard." + std::string(kCrLf) +
                       "Use <CTRL-V> to paste the information in your mail program or a text "
                       "editor."});
}

std::string AboutBox::spyText(const std::string& section, const std::string& name) {
    return readRegistryText(registry_, HKEY_LOCAL_MACHINE, section, name, "");
}

void AboutBox::writeSpy(const std::string& name, const std::string& value) {
    registry_.ClassKey = HKEY_LOCAL_MACHINE;
    registry_.SectionKey = kSpyOptions;
    registry_.ValueKey = name;
    registry_.setValue(value);
}

void AboutBox::StartNISpy_Click() {
    const std::string folder = spyText(kSpy, "InstDir");
    if (folder.empty()) {
        s_.boxes.show({BoxIcon::Information, "NI Spy is not installed."});
        return;
    }
    const std::string program = folder + "/" + kSpyProgram;
    if (!s_.files.stat(program).isRegular()) {
        s_.boxes.show({BoxIcon::Information, "NI Spy not found."});
        return;
    }
    const double now = s_.clock.date();
    const std::string log = "NISpy_" + replaceAll(s_.clock.Clock::dateText(now), "-", ".") + " " +
                            replaceAll(s_.clock.Clock::timeText(now), ":", ".") + ".spy";
    const BoxAnswer answer = s_.boxes.show(
        {BoxIcon::Question,
         "The National Instruments SPY will start in order to generate an error log." +
             std::string(kCrLf) + log + kCrLf + "Continue?",
         kProgramTitle, BoxButtons::YesNo});
    if (answer != BoxAnswer::Yes) return;
    writeSpy("Log Enabled", "1");
    writeSpy("Log File Name", log);
    writeSpy("History Depth", kHistoryDepth);
    if (!s_.launcher.start(program, {})) s_.boxes.show({BoxIcon::Information, "NI Spy not found."});
}

}  // namespace zel
