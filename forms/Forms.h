#pragma once
// All forms of the program, each of which exists once.

#include <string>
#include <string_view>
#include <vector>

#include "forms/ControllerForm.h"
#include "forms/MainForm.h"
#include "forms/ScriptForms.h"
#include "forms/ServerForm.h"
#include "forms/SupportForms.h"
#include "forms/WaterfallForm.h"
#include "platform/Controls.h"
#include "platform/Event.h"
#include "platform/Form.h"

namespace zel {

class TCPConnectionForm : public Form {
  public:
    TCPConnectionForm() : Form("TCPConnectionForm") {
        Caption = "TCP/IP Connection";
        addVariables({{"Connecting", &Connecting}});
    }
    bool Connecting = false;  ///< the socket is being connected
    DropDownList RecentServersList{*this, "RecentServersList"};
    TextBox IPAdressTextBox{*this, "IPAdressTextBox"};
    TextBox RemotePortTextBox{*this, "RemotePortTextBox"};
    CheckBox chkTls{*this, "chkTls", "Encrypt the connection (TLS)"};
    TextBox FingerprintTextBox{*this, "FingerprintTextBox"};
    TextBox IDTextBox{*this, "IDTextBox"};
    Label AdviceLabel{*this, "AdviceLabel"};  ///< how long a wait lasts; what to check after it
    Label lblReason{*this, "lblReason"};      ///< why there is no connection
    Button ConnectTCPButton{*this, "ConnectTCPButton", "Connect"};
    Button QuitTCPButton{*this, "QuitTCPButton", "Close"};
};

class DevicesChoiceForm : public Form {
  public:
    DevicesChoiceForm() : Form("DevicesChoiceForm") {
        Caption = "Communication Device";
        addVariables({{"Configuring", &Configuring}});
    }
    bool Configuring = false;  ///< a device gets its commands
    DropDownList AvailableDevicesChoice{*this, "AvailableDevicesChoice"};
    DropDownList DevicesPortList{*this, "DevicesPortList", true};
    DropDownList DevicesBaudList{*this, "DevicesBaudList", true};
    Label DeviceStatusLabel{*this, "DeviceStatusLabel"};
    Button SetDeviceButton{*this, "SetDeviceButton", "Set"};
    Button CloseDevicesButton{*this, "CloseDevicesButton", "Close"};
};

/// The recording's dialog.
class TimeForm : public Form {
  public:
    TimeForm() : Form("TimeForm") {
        Caption = "Record Data";
        addVariables({{"ContinuousRecording", &ContinuousRecording},
                      {"RecordedCount", &RecordedCount},
                      {"TickCount", &TickCount},
                      {"IncompleteCount", &IncompleteCount},
                      {"FailedCount", &FailedCount}});
    }
    bool ContinuousRecording = false;  ///< traces are appended to the file
    double RecordedCount = 0;          ///< traces taken so far; 0 asks for the full read cycle
    double TickCount = 0;              ///< attempts of this recording, be they good or not
    double IncompleteCount = 0;        ///< of them, traces of which samples are missing
    double FailedCount = 0;            ///< of them, those that brought no trace
    Event<> Ticked;                    ///< an attempt is over
    Label lblRecText{*this, "lblRecText", "Record data every"};
    TextBox TimeIntervalBox{*this, "TimeIntervalBox"};  ///< s
    Button SubmitTimeButton{*this, "SubmitTimeButton", "OK"};
    Button CancelTimeButton{*this, "CancelTimeButton", "Cancel"};
    Timer X{*this, "X", 0};
};

/// What the power sensor's readings bring: the power alone, or the reflection as well.
class PowerAndReflForm : public Form {
  public:
    PowerAndReflForm() : Form("PowerAndReflForm") {
        Caption = "Power Sensor";
        addVariables({{"ReadPowerOnly", &ReadPowerOnly}, {"ReadPowerAndRefl", &ReadPowerAndRefl}});
    }
    bool ReadPowerOnly = true;
    bool ReadPowerAndRefl = false;
    OptionButton PowerOnlyOption{*this, "PowerOnlyOption", "reading", "Read Power Only"};
    OptionButton PowerAndLeflOption{*this, "PowerAndLeflOption", "reading",
                                    "Read Power and Reflection"};
    Button ClosePwrForm{*this, "ClosePwrForm", "Close"};
};

/// The manual scale of the y axis.
class ManualScaleForm : public Form {
  public:
    ManualScaleForm() : Form("ManualScaleForm") { Caption = "Graph Settings"; }
    TextBox manualSizeMax{*this, "manualSizeMax"};
    TextBox manualSizeMin{*this, "manualSizeMin"};
    Button cmdAccept{*this, "cmdAccept", "Accept"};
    Button cmdCancel{*this, "cmdCancel", "Cancel"};
};

struct Forms {
    ControllerForm controller;
    MainForm main;
    ServerForm server;
    TCPConnectionForm tcpConnection;
    DevicesChoiceForm devicesChoice;
    TimeForm time;
    WaterfallForm waterfall;
    SpecialMeasForm specialMeas;
    ScriptEditor scriptEditor;
    STDForm std;
    AboutForm about;
    ErrorForm error;
    DoctorForm doctor;
    PowerAndReflForm powerAndRefl;
    ManualScaleForm manualScale;

    std::vector<Form*> all();
    /// By the form's name; null if there is none.
    Form* form(std::string_view name);
    /// "MainForm.ZELButton"; a control of the panel needs no prefix. Null if there is none.
    Control* control(std::string_view path);
};

}  // namespace zel
