#include "shell/Guards.h"

#include <string>
#include <utility>

#include "platform/MessageBox.h"
#include "platform/Platform.h"
#include "support/Text.h"

namespace zel {

BoxAnswer QuietBoxes::show(const Box& box) {
    if (box.buttons == BoxButtons::Ok && quiet && quiet()) return BoxAnswer::Ok;
    return boxes_.show(box);
}

bool ReportedSettings::set(const std::string& application, const std::string& section,
                           const std::string& key, const std::string& value) {
    if (settings_.set(application, section, key, value)) return true;
    if (!std::exchange(reported_, true)) {
        std::string text = "The settings cannot be stored";
        if (const std::string file = settings_.place(); !file.empty()) text += " in " + file;
        boxes_.show({BoxIcon::Exclamation,
                     text + "." + kCrLf + "The program goes on and forgets them at its end."});
    }
    return false;
}

Guards::Guards(const Platform& front)
    : boxes(front.boxes),
      settings(front.settings, boxes),
      log(front.clock, front.files),
      port(front.serialPort, log),
      socket(front.tcpSocket, log),
      serverPort(front.serverPort, log),
      platform{front.clock,    front.events,       boxes,
               port,           front.serialPorts,  socket,
               serverPort,     front.serverSocket, settings,
               front.debug,    front.clipboard,    front.launcher,
               front.startup,  front.folder,       front.fileDialogs,
               front.files,    front.endSignals,   front.machine,
               front.portProbe} {}

}  // namespace zel
