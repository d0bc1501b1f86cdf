#pragma once
// The whole platform on Qt, in one bundle.

#include <QString>

#include "desktop/platform/QtClock.h"
#include "desktop/platform/QtDialogs.h"
#include "desktop/platform/QtEvents.h"
#include "desktop/platform/QtSerialPort.h"
#include "desktop/platform/QtServerSocket.h"
#include "desktop/platform/QtServices.h"
#include "desktop/platform/QtSignals.h"
#include "desktop/platform/QtSocket.h"
#include "desktop/platform/SystemFiles.h"
#include "platform/Platform.h"

namespace zel {

/// Needs a QCoreApplication; the windows of boxes and dialogs need a QApplication.
struct QtPlatform {
    explicit QtPlatform(const QString& home = {}) : folder(home) {
        events.setWakeDescriptor(endSignals.descriptor());
    }

    QtSignals endSignals;
    QtClock clock;
    QtEvents events{clock};
    QtMessageBoxes boxes;
    QtSerialPort serialPort{events};
    QtSerialPortList serialPorts;
    QtSocket tcpSocket{events};
    QtSerialPort serverPort{events, false};
    QtServerSocket serverSocket{events};
    QtApplicationFolder folder;
    QtSettingsStore settings{folder};
    QtDebugChannel debug;
    QtClipboard clipboard;
    QtLauncher launcher;
    QtStartupFolder startup;
    QtFileDialogs fileDialogs;
    SystemFiles files;

    Platform bundle() { return bundle(boxes, fileDialogs); }
    /// With boxes and file dialogs of another front.
    Platform bundle(MessageBoxes& otherBoxes, FileDialogs& otherDialogs) {
        return {clock,      events,       otherBoxes,   serialPort, serialPorts, tcpSocket,
                serverPort, serverSocket, settings,     debug,      clipboard,   launcher,
                startup,    folder,       otherDialogs, files,      endSignals};
    }
};

}  // namespace zel
