#include "connection/DoctorKeys.h"

#include <optional>
#include <string>

#include "connection/Doctor.h"
#include "forms/Forms.h"
#include "platform/Events.h"
#include "platform/LinkAddress.h"
#include "platform/ModalForm.h"
#include "platform/Services.h"
#include "support/AtEnd.h"
#include "support/LinkAddressText.h"
#include "support/Text.h"

namespace zel {

DoctorKeys::DoctorKeys(Forms& forms, Doctor& doctor, Clipboard& clipboard, Events& events)
    : form_(forms.doctor),
      dialog_(forms.main),
      doctor_(doctor),
      clipboard_(clipboard),
      events_(events) {
    form_.FindingsBox.Locked = true;
    handlers_.on(forms.controller.UtilityDoctor.Clicked, [this] { UtilityDoctor_Click(); });
    handlers_.on(form_.cmdRunAgain.Clicked, [this] { cmdRunAgain_Click(); });
    handlers_.on(form_.cmdCopy.Clicked, [this] { clipboard_.setText(form_.FindingsBox.Text); });
    handlers_.on(form_.cmdClose.Clicked, [this] { form_.Hide(); });
    handlers_.on(form_.QueryUnload, [this](int&) { form_.Hide(); });
    // Whoever hides the form, such as the end of the program, ends the examination as well.
    handlers_.on(form_.Changed, [this] {
        if (!form_.Visible && form_.Examining) doctor_.stop();
    });
}

DoctorKeys::~DoctorKeys() {
    if (task_ != 0) events_.cancel(task_);
}

void DoctorKeys::UtilityDoctor_Click() {
    if (form_.Visible) return;
    const std::string port = dialog_.COMList.Text();
    const std::string baud = dialog_.BaudList.Text();
    if (!port.empty()) form_.AddressBox.Text = "serial:" + port + (baud.empty() ? "" : "@" + baud);
    task_ = events_.schedule(0, [this] {
        task_ = 0;
        cmdRunAgain_Click();
    });
    showModalForm(form_, events_);
}

void DoctorKeys::cmdRunAgain_Click() {
    if (form_.Examining) return;
    std::optional<LinkAddress> address;
    if (const std::string text = trimmed(form_.AddressBox.Text.get()); !text.empty()) {
        address = parseLinkAddress(text);
        if (!address) {
            form_.StatusLabel.Caption =
                "The connection is written as serial:DEVICE@BAUD or "
                "tcp:HOST:PORT.";
            return;
        }
    }
    form_.Examining = true;
    form_.cmdRunAgain.Enabled = false;
    form_.FindingsBox.Text = "";
    form_.StatusLabel.Caption = "Looking at the connection...";
    const AtEnd over([this] {
        form_.Examining = false;
        form_.cmdRunAgain.Enabled = true;
    });
    int faults = 0;
    doctor_.examine(address, [this, &faults](const Finding& finding) {
        if (finding.grade == Finding::Grade::Fault) ++faults;
        form_.FindingsBox.Text = form_.FindingsBox.Text.get() + findingLine(finding) + kCrLf;
    });
    form_.StatusLabel.Caption = faults == 0 ? "Done. No fault was found."
                                            : "Done. Faults found: " + std::to_string(faults) + ".";
}

}  // namespace zel
