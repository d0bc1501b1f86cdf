#pragma once
// The whole platform on Qt, in one bundle.

#include "desktop/platform/QtDialogs.h"
#include "desktop/platform/QtSystem.h"
#include "desktop/platform/SimulatorChild.h"
#include "platform/MessageBox.h"
#include "platform/Platform.h"
#include "platform/Services.h"

namespace zel {

/// Needs a QCoreApplication; the windows of boxes and dialogs need a QApplication.
struct QtPlatform : QtSystem {
    using QtSystem::QtSystem;

    QtMessageBoxes boxes;
    QtClipboard clipboard;
    SimulatorChild launcher;
    QtFileDialogs fileDialogs{settings, folder};

    Platform bundle() { return bundle(boxes, fileDialogs); }
    /// With boxes and file dialogs of another front.
    Platform bundle(MessageBoxes& otherBoxes, FileDialogs& otherDialogs) {
        return {clock,        events,   otherBoxes, serialPort, serialPorts, tcpSocket, serverPort,
                serverSocket, settings, debug,      clipboard,  launcher,    startup,   folder,
                otherDialogs, files,    endSignals, machine,    portProbe};
    }
};

}  // namespace zel
