#pragma once
// The connection dialog.

#include <string>
#include <vector>

#include "platform/Controls.h"
#include "platform/Form.h"

namespace zel {

class MainForm : public Form {
  public:
    MainForm() : Form("MainForm") {
        Caption = "Connect";
        addVariables({{"IsConnectedToPort", &IsConnectedToPort},
                      {"CommandIsIDN", &CommandIsIDN},
                      {"IsConnecting", &IsConnecting},
                      {"ModemConnected", &ModemConnected},
                      {"Dialling", &Dialling},
                      {"Searching", &Searching}});
        SearchRatesButton.Visible = false;  // until an attempt has failed
    }

    std::vector<std::string> CommPorts;  ///< names of the serial ports
    bool IsConnectedToPort = false;      ///< the port was opened through the dialog
    bool CommandIsIDN = false;
    bool IsConnecting = false;    ///< the handshake runs
    bool ModemConnected = false;  ///< a dialled link is up
    bool Dialling = false;        ///< a dial is under way
    bool Attempting = false;      ///< the instrument is woken and asked for its state
    bool Searching = false;       ///< the baud rates are tried one by one

    DropDownList COMList{*this, "COMList", true};
    DropDownList BaudList{*this, "BaudList", true};
    Frame DirectConnectionFrame{*this, "DirectConnectionFrame", "Serial Port"};
    Frame ModemConnectionFrame{*this, "ModemConnectionFrame", "Dial"};
    TextBox TelNumberBox{*this, "TelNumberBox"};
    TextBox AirBaudRateText{*this, "AirBaudRateText"};
    TextBox IDText{*this, "IDText"};
    Picture OnPic{*this, "OnPic", "on"};
    Label AdviceLabel{*this, "AdviceLabel"};  ///< how long a wait lasts; what to check after it
    Button ZELButton{*this, "ZELButton", "Connect"};
    Button SearchRatesButton{*this, "SearchRatesButton", "Search Baud Rates"};
    Button DisconnectButton{*this, "DisconnectButton", "Disconnect"};
    Button DialButton{*this, "DialButton", "Dial"};
    Button CancelButton{*this, "CancelButton", "Cancel"};
    Button DisconnectButton2{*this, "DisconnectButton2", "Disconnect"};
    Button SaveSettingsButton{*this, "SaveSettingsButton", "Save Settings"};
    Button LoadSettingsButton{*this, "LoadSettingsButton", "Load Settings"};
    Button CancelConnButton{*this, "CancelConnButton", "Close"};
    Button CancelConnButton1{*this, "CancelConnButton1", "Close"};
};

}  // namespace zel
