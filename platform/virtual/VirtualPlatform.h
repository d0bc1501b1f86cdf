#pragma once
// The whole platform of tests and of the built-in simulator: virtual time, scripts and memory.

#include "platform/Files.h"
#include "platform/Platform.h"
#include "platform/SerialPort.h"
#include "platform/Signals.h"
#include "platform/virtual/FixedMachine.h"
#include "platform/virtual/MemoryServices.h"
#include "platform/virtual/RecordedBoxes.h"
#include "platform/virtual/ScriptedPort.h"
#include "platform/virtual/ScriptedServer.h"
#include "platform/virtual/ScriptedSocket.h"
#include "platform/virtual/VirtualFiles.h"
#include "platform/virtual/VirtualTime.h"

namespace zel {

struct VirtualPlatform {
    VirtualClock clock;
    VirtualEvents events{clock};
    RecordedBoxes boxes;
    ScriptedPort port{events};
    FixedPortList ports;
    ScriptedSocket tcpSocket{events};
    ScriptedPort serverPort{events};
    ScriptedServer serverSocket{events};
    MemorySettings settings;
    MemoryDebugChannel debug;
    MemoryClipboard clipboard;
    MemoryLauncher launcher;
    MemoryStartupFolder startup;
    FixedApplicationFolder folder;
    QueuedFileDialogs fileDialogs;
    VirtualFiles files{clock};
    Signals endSignals;
    FixedMachine machine{files, clock};
    FixedProbe portProbe;

    /// The bundle with the scripted port.
    Platform bundle() { return bundle(port); }
    /// The bundle with another port on this time, such as a simulated instrument.
    Platform bundle(SerialPort& other) { return bundle(other, files); }
    /// The same on another disk.
    Platform bundle(SerialPort& other, FileService& disk) {
        return {clock,        events,   boxes,      other,     ports,    tcpSocket, serverPort,
                serverSocket, settings, debug,      clipboard, launcher, startup,   folder,
                fileDialogs,  disk,     endSignals, machine,   portProbe};
    }
};

}  // namespace zel
