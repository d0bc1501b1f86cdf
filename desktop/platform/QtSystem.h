#pragma once
// The part of the platform on Qt that needs no window, in one bundle.

#include <QString>

#include "desktop/platform/LateSocket.h"
#include "desktop/platform/QtClock.h"
#include "desktop/platform/QtEvents.h"
#include "desktop/platform/QtSerialPort.h"
#include "desktop/platform/QtServices.h"
#include "desktop/platform/QtSignals.h"
#include "desktop/platform/SystemFiles.h"
#include "desktop/platform/SystemMachine.h"
#include "desktop/platform/SystemPortProbe.h"

namespace zel {

/// Needs a QCoreApplication.
struct QtSystem {
    explicit QtSystem(const QString& home = {}) : folder(home) {
        events.setWakeDescriptor(endSignals.descriptor());
    }

    QtSignals endSignals;
    QtClock clock;
    QtEvents events{clock};
    QtSerialPort serialPort{events};
    QtSerialPortList serialPorts;
    LateSocket tcpSocket{events};
    QtSerialPort serverPort{events, false};
    LateServerSocket serverSocket{events};
    QtApplicationFolder folder;
    SystemFiles files;
    QtSettingsStore settings{folder, files};
    QtDebugChannel debug;
    QtStartupFolder startup;
    SystemMachine machine;
    SystemPortProbe portProbe;
};

}  // namespace zel
