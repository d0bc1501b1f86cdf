#include "support/ErrorReport.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include "forms/SupportForms.h"
#include "platform/Controls.h"
#include "platform/Files.h"
#include "platform/MessageBox.h"
#include "platform/ModalForm.h"
#include "support/FileText.h"
#include "support/RootDebug.h"
#include "support/SupportAddress.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr std::size_t kMostLines = 200;

std::string hexadecimal(std::int32_t number) {
    constexpr char kDigits[] = "0123456789ABCDEF";
    std::string hex;
    for (auto rest = static_cast<std::uint32_t>(number); rest != 0 || hex.empty(); rest >>= 4)
        hex.insert(hex.begin(), kDigits[rest & 0xF]);
    return hex;
}

std::string textOfLines(const std::vector<std::string>& lines, std::size_t first) {
    std::string text;
    for (std::size_t i = first; i < lines.size(); ++i) text += lines[i] + kCrLf;
    return text;
}

}  // namespace

ErrorReport::ErrorReport(ErrorForm& form, const Services& services)
    : form_(form), services_(services) {
    handlers_.on(form_.CopyToClipboard.Clicked, [this] { CopyToClipboard_Click(); });
    handlers_.on(form_.ButtonOK.Clicked, [this] { ButtonOK_Click(); });
    handlers_.on(form_.chkAttachLog.Clicked, [this] { chkAttachLog_Click(); });
    handlers_.on(form_.cmdSaveReport.Clicked, [this] { cmdSaveReport_Click(); });
    handlers_.on(form_.QueryUnload, [this](int&) { ButtonOK_Click(); });
    for (TextBox& info : form_.Info) info.Locked = true;
}

void ErrorReport::fillLabels(const std::string& first) {
    const std::string app = kProgramTitle;
    form_.Label(0).Caption = first;
    form_.Label(1).Caption = "Please tell Marlow && Tenby about this problem:";
    form_.Label(2).Caption =
        "We have created an error report that you can send to help us improve " + app + ".";
    form_.Label(3).Caption =
        "Please press the button \"&Copy to clipboard\". You can use any application to paste the "
        "report using <Ctrl-V>.";
    form_.Label(4).Caption = std::string(kCrLf) + "Please mail it to " + kSupportAddress + ".";
}

void ErrorReport::DisplayError(const RuntimeFailure& failure,
                               const std::vector<std::string>& callers) {
    if (form_.Visible) return;
    form_.isOpen = true;
    fillLabels(std::string(kProgramTitle) +
               " has encounted a problem and needs to close. We are sorry for the inconvenience.");
    // "&&" of a caption is one "&" where the report is shown or copied.
    const std::string lines[] = {
        "SOURCE      : " + failure.source,
        captionText("NUMBER      : " + std::to_string(failure.number) + " = &&H" +
                    hexadecimal(failure.number)),
        "DESCRIPTION : " + failure.description,
        "CALLER STACK:",
    };
    own_.clear();
    for (int i = 0; i < form_.Info.count(); ++i) {
        form_.Info(i).Text = lines[i];
        form_.Info(i).Visible = true;
        own_ += lines[i] + kCrLf;
    }
    std::vector<std::string> list;
    for (std::size_t i = 0; i < callers.size(); ++i) {
        list.push_back(std::string(i, ' ') + ">" + callers[i]);
        own_ += list.back() + kCrLf;
    }
    form_.CallerList.Items = list;
    show();
}

void ErrorReport::displayCrash(const std::string& trace) {
    if (form_.Visible) return;
    fillLabels(std::string(kProgramTitle) +
               " was ended by a fault when it ran last. We are sorry for the inconvenience.");
    own_ = trace;
    for (TextBox& info : form_.Info) info.Visible = false;
    std::vector<std::string> list;
    for (const std::string& line : split(replaceAll(trace, "\r", ""), '\n'))
        if (!line.empty()) list.push_back(line);
    form_.CallerList.Items = list;
    show();
}

void ErrorReport::show() {
    const std::vector<std::string> lines =
        sessionLines ? sessionLines() : std::vector<std::string>();
    form_.chkAttachLog.setValue(false);
    form_.chkAttachLog.Enabled = !lines.empty();
    form_.reportText = own_;
    if (print) return print(form_.reportText);
    showModalForm(form_, services_.events);
}

void ErrorReport::chkAttachLog_Click() {
    form_.reportText = own_;
    if (!form_.chkAttachLog.Value() || !sessionLines) return;
    const std::vector<std::string> lines = sessionLines();
    const std::size_t first = lines.size() > kMostLines ? lines.size() - kMostLines : 0;
    form_.reportText += std::string("SESSION:") + kCrLf + textOfLines(lines, first);
}

void ErrorReport::CopyToClipboard_Click() {
    services_.clipboard.setText("");
    services_.clipboard.setText(form_.reportText);
    services_.boxes.show({BoxIcon::Information, "Support informations copied to clipboard." +
                                                    std::string(kCrLf) + "  Please mail to " +
                                                    kSupportAddress});
}

void ErrorReport::cmdSaveReport_Click() {
    const auto path = services_.dialogs.save({.title = "Save report",
                                              .filter = "Text (*.txt)|*.txt|All files (*.*)|*.*",
                                              .folder = {},
                                              .fileName = "ZELRemote report.txt",
                                              .promptOverwrite = true});
    if (!path) return;
    const FileProblem why = services_.files.replace(*path, form_.reportText);
    if (!why.empty()) services_.boxes.show({BoxIcon::Critical, writeProblem(*path, why)});
}

void ErrorReport::ButtonOK_Click() { form_.Hide(); }

}  // namespace zel
