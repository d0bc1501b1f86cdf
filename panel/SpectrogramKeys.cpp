#include "panel/SpectrogramKeys.h"

#include <string>

#include "files/FileOps.h"
#include "files/OutputFile.h"
#include "forms/ControllerForm.h"
#include "platform/MessageBox.h"
#include "waterfall/SweepHistory.h"

namespace zel {

SpectrogramKeys::SpectrogramKeys(ControllerForm& panel, const SweepHistory& history, FileOps& files,
                                 MessageBoxes& boxes)
    : panel_(panel), history_(history), files_(files), boxes_(boxes) {
    handlers_.on(panel_.SpectrogramShow.Clicked, [this] { SpectrogramShow_Click(); });
    handlers_.on(panel_.SpectrogramPause.Clicked, [this] { SpectrogramPause_Click(); });
    handlers_.on(panel_.SpectrogramSave.Clicked, [this] { SpectrogramSave_Click(); });
    handlers_.on(panel_.SpectrogramRow, [this](int back) { showRow(back); });
    panel_.SpectrogramPicture.Visible = false;
    panel_.SpectrogramPause.Enabled = false;
}

void SpectrogramKeys::SpectrogramShow_Click() {
    const bool shown = !panel_.SpectrogramPicture.Visible;
    panel_.SpectrogramPicture.Visible = shown;
    panel_.SpectrogramShow.Checked = shown;
    panel_.SpectrogramPause.Enabled = shown;
    panel_.SpectrogramPause.Checked = false;
}

void SpectrogramKeys::SpectrogramPause_Click() {
    panel_.SpectrogramPause.Checked = !panel_.SpectrogramPause.Checked;
}

void SpectrogramKeys::SpectrogramSave_Click() {
    const std::string text = history_.recording();
    if (text.empty()) {
        boxes_.show({BoxIcon::Information, "There are no sweeps to save."});
        return;
    }
    const std::string path = files_.ShowSaveDataDialog(FileOps::kCsvFilter);
    if (path.empty()) return;
    OutputFile file(files_.service(), path, OutputFile::Mode::Output);
    file.text() = text;
    const std::string problem = file.close();
    if (!problem.empty()) boxes_.show({BoxIcon::Critical, problem});
}

void SpectrogramKeys::showRow(int back) {
    if (back < 0 || back >= history_.count()) return;
    const HistoryRow& row = history_.row(back);
    panel_.CWGraph1.plotY(row.levels(), row.firstX, row.increment);
    panel_.CWGraph1.Note = "SWEEP OF " + row.time;
}

}  // namespace zel
