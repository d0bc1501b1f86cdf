// Any bytes as a log of the older format: no crash, arrays of one trace.

#include <cstdlib>

#include "fuzz/SavedFiles.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    zel::SavedFiles desk;
    const zel::ControllerForm& panel = desk.forms.controller;
    desk.reader.LoadTheDataForOlderVersions(zel::textOf(data, size));
    if (panel.DataXAxisArrayToLoad.size() > 301) std::abort();
    if (panel.DataValArrayToLoad.size() > 602) std::abort();
    return 0;
}
