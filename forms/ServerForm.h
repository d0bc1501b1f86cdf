#pragma once
// The server's window.

#include <cstdint>
#include <string>
#include <vector>

#include "platform/Controls.h"
#include "platform/Form.h"

namespace zel {

class ServerForm : public Form {
  public:
    ServerForm() : Form("ServerForm") {
        Caption = "Server Mode";
        addVariables({{"doBinaryData", &doBinaryData},
                      {"ServerConnecting", &ServerConnecting},
                      {"ServerScanStop", &ServerScanStop},
                      {"SavedCaption", &SavedCaption},
                      {"ListenState", &ListenState},
                      {"ClientState", &ClientState}});
    }
    std::vector<std::string> CommPorts;  ///< names of the serial ports
    bool doBinaryData = false;           ///< the instrument's next bytes are a binary trace
    bool ServerConnecting = false;       ///< the search runs; the line's bytes are its own
    bool ServerScanStop = false;         ///< silence above the lowest speed: no instrument
    std::string SavedCaption;            ///< the panel's caption before the server's
    std::string ListenAddress;           ///< empty for all addresses
    std::int16_t ListenState = 0;        ///< 0 closed, 2 listening, 9 error
    std::int16_t ClientState = 0;        ///< 0 none, 7 connected

    TextBox localIPTextBox{*this, "localIPTextBox"};
    TextBox localPortTextBox{*this, "localPortTextBox", "2277"};
    DropDownList COMList{*this, "COMList", true};
    DropDownList BaudList{*this, "BaudList", true};
    CheckBox chkBaudRate{*this, "chkBaudRate", "Find the baud rate"};
    TextBox txtAllowed{*this, "txtAllowed"};
    CheckBox chkKeep{*this, "chkKeep", "Keep the client at work: refuse newcomers"};
    Button cmdConnect{*this, "cmdConnect", "connect"};
    Button cmdCancel{*this, "cmdCancel", "cancel"};
    Picture picConnected{*this, "picConnected", "on"};
    Label lblState{*this, "lblState", "Not listening"};
    Label lblClient{*this, "lblClient", "Client"};
    TextBox txtClientIP{*this, "txtClientIP"};
    Button cmdDisconnectClient{*this, "cmdDisconnectClient", "Disconnect client"};
    Button cmdCopyAddress{*this, "cmdCopyAddress", "Copy address"};
    Label lblToInstrument{*this, "lblToInstrument"};
    Label lblToClient{*this, "lblToClient"};
    ListBox lstEvents{*this, "lstEvents"};
    TextBox txtDebug{*this, "txtDebug"};
};

}  // namespace zel
