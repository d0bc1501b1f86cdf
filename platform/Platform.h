#pragma once
// Everything that a front end supplies to the program, in one bundle of references.

#include "platform/Clock.h"
#include "platform/Events.h"
#include "platform/Files.h"
#include "platform/Machine.h"
#include "platform/MessageBox.h"
#include "platform/PortProbe.h"
#include "platform/SerialPort.h"
#include "platform/ServerSocket.h"
#include "platform/Services.h"
#include "platform/Signals.h"
#include "platform/Socket.h"

namespace zel {

/// Only the composition root takes this; a module takes the references that it uses.
struct Platform {
    Clock& clock;
    Events& events;
    MessageBoxes& boxes;
    SerialPort& serialPort;  ///< the connection's port, `ZELCommC`
    SerialPortList& serialPorts;
    Socket& tcpSocket;           ///< the client side, `TCPSocket`
    SerialPort& serverPort;      ///< the server's own port, `SystemCommPort`
    ServerSocket& serverSocket;  ///< the server's, `TCPSocket` of the server form
    SettingsStore& settings;
    DebugChannel& debug;
    Clipboard& clipboard;
    Launcher& launcher;
    StartupFolder& startup;
    ApplicationFolder& folder;
    FileDialogs& fileDialogs;
    FileService& files;
    Signals& endSignals;
    Machine& machine;
    PortProbe& portProbe;
};

}  // namespace zel
