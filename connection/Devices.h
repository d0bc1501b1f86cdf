#pragma once
// Communication devices: their commands in "settings.ini", and the dialog that sends them.

#include <string>
#include <vector>

#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "platform/Clock.h"
#include "platform/Event.h"
#include "platform/Events.h"
#include "platform/Files.h"
#include "platform/MessageBox.h"
#include "platform/SerialPort.h"
#include "platform/Services.h"
#include "platform/Session.h"
#include "support/IniFile.h"

namespace zel {

class Devices {
  public:
    /// Where the commands of the devices stand.
    struct Store {
        ApplicationFolder& folder;
        FileService& files;
    };
    /// Connects the menu entry and the dialog's buttons.
    Devices(Forms& forms, SerialPort& ZELCommC, SerialPortList& ports, const Store& store,
            const Session& session);

    /// The names of the file, in its order; "NONE" alone when it yields nothing.
    std::vector<std::string> ReadCommunicationDevices();
    void SetDevice_Click();
    /// Opens the dialog's port and sends the chosen device its commands. True when it took them.
    bool SetCommunicationDevice();

  private:
    void Form_Load();
    IniFile settings() const;
    bool openPort();
    void ConfigureDevice(bool& ok);
    bool sendCommand(const std::string& command);
    void close();

    ControllerForm& panel_;
    DevicesChoiceForm& form_;
    SerialPort& port_;
    SerialPortList& ports_;
    Store store_;
    const Clock& clock_;
    Events& events_;
    MessageBoxes& boxes_;
    bool cancelled_ = false;
    Handlers handlers_;
};

}  // namespace zel
