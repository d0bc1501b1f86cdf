#pragma once
// The windows that help when something is wrong: about the program, the report of a failure, the
// connection doctor.

#include <string>

#include "platform/Controls.h"
#include "platform/Form.h"

namespace zel {

/// Title and version, and what a support person wants to know of the machine, in three parts.
class AboutForm : public Form {
  public:
    AboutForm() : Form("AboutForm") { Caption = "About ZELRemote"; }
    Label TitleLabel{*this, "TitleLabel", "ZELRemote"};
    Label VersionLabel{*this, "VersionLabel"};
    Label LicenceLabel{*this, "LicenceLabel"};
    Button ShowSystemInfo{*this, "ShowSystemInfo"};
    TextBox SystemInfo{*this, "SystemInfo"};
    Button ShowDriverInfo{*this, "ShowDriverInfo"};
    TextBox DriverInfo{*this, "DriverInfo"};
    Button ShowLegalNotes{*this, "ShowLegalNotes"};
    TextBox LegalNotes{*this, "LegalNotes"};
    Button CreateSupportString{*this, "CreateSupportString", "Copy to clipboard"};
    Button StartNISpy{*this, "StartNISpy", "Start NI Spy"};
    Button ButtonOK{*this, "ButtonOK", "OK"};
};

/// The report of a failure that ends the program.
class ErrorForm : public Form {
  public:
    ErrorForm() : Form("ErrorForm") {
        Caption = "ZELRemote Error";
        addVariables({{"isOpen", &isOpen}, {"reportText", &reportText}});
    }
    bool isOpen = false;     ///< a report was displayed
    std::string reportText;  ///< the whole report, as it is copied

    Picture ErrirPicture{*this, "ErrirPicture", "critical"};
    ControlArray<zel::Label, 5> Label{*this, "Label", std::string()};
    ControlArray<TextBox, 4> Info{*this, "Info", std::string()};
    ListBox CallerList{*this, "CallerList"};
    CheckBox chkAttachLog{*this, "chkAttachLog", "Attach the last 200 lines of the session"};
    Button CopyToClipboard{*this, "CopyToClipboard", "&Copy to clipboard"};
    Button cmdSaveReport{*this, "cmdSaveReport", "Save report..."};
    Button ButtonOK{*this, "ButtonOK", "OK"};
};

/// What is right and wrong on the way to the instrument.
class DoctorForm : public Form {
  public:
    DoctorForm() : Form("DoctorForm") {
        Caption = "Connection Doctor";
        addVariables({{"Examining", &Examining}});
    }
    bool Examining = false;  ///< an examination is under way
    zel::Label AddressCaption{*this, "AddressCaption", "Connection"};
    TextBox AddressBox{*this, "AddressBox"};
    zel::Label StatusLabel{*this, "StatusLabel"};
    TextBox FindingsBox{*this, "FindingsBox"};
    Button cmdRunAgain{*this, "cmdRunAgain", "Run again"};
    Button cmdCopy{*this, "cmdCopy", "Copy"};
    Button cmdClose{*this, "cmdClose", "Close"};
};

}  // namespace zel
