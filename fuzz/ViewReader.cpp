// Any bytes as a saved view or a recording: no crash, no endless series, arrays of one trace.

#include <cstdlib>

#include "fuzz/SavedFiles.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    zel::SavedFiles desk;
    zel::ControllerForm& panel = desk.forms.controller;
    panel.StopButton.Visible = false;  // as the start of the program leaves it
    desk.reader.LoadTheData(zel::textOf(data, size), "2026-01-01 12:00:00", 0);
    if (panel.DataXAxisArrayToLoad.size() > 301) std::abort();
    if (panel.DataValArrayToLoad.size() > 602) std::abort();
    if (!panel.Connection.Enabled || panel.StopButton.Visible) std::abort();
    return 0;
}
