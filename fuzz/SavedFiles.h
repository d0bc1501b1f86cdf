#pragma once
// A reader of saved files with all that it stands on, and no instrument.

#include <cstddef>
#include <cstdint>
#include <string>

#include "files/FileOps.h"
#include "files/ViewReader.h"
#include "forms/Forms.h"
#include "link/ZELBas.h"
#include "model/ZEL3Variables.h"
#include "platform/virtual/VirtualPlatform.h"
#include "trace/GraphScaling.h"
#include "trace/Interlock.h"
#include "trace/Sweep.h"
#include "trace/TraceConversion.h"

namespace zel {

struct SavedFiles {
    VirtualPlatform platform;
    Forms forms;
    ZEL3Variables mirror;
    FileOps files{forms.controller, platform.fileDialogs, platform.folder, platform.files,
                  platform.clock};
    GraphScaling scaling{forms.controller, forms.waterfall, mirror, platform.clock};
    TraceConversion conversion{forms.controller, forms.waterfall.Graph3D};
    Sweep onGraph;
    ZELBas line;
    Interlock interlock{
        forms,
        line,
        {platform.clock, platform.events, platform.boxes, forms.controller.DebugTextBox}};
    ViewReader reader{forms, mirror, {onGraph, conversion, scaling}, files, interlock};
};

inline std::string textOf(const std::uint8_t* data, std::size_t size) {
    return {reinterpret_cast<const char*>(data), size};
}

}  // namespace zel
