#pragma once
// The menu of the spectrogram under the graph: show, pause, save; a row of it as the trace.

#include "files/FileOps.h"
#include "forms/ControllerForm.h"
#include "platform/Event.h"
#include "platform/MessageBox.h"
#include "waterfall/SweepHistory.h"

namespace zel {

class SpectrogramKeys {
  public:
    SpectrogramKeys(ControllerForm& panel, const SweepHistory& history, FileOps& files,
                    MessageBoxes& boxes);

    void SpectrogramShow_Click();
    void SpectrogramPause_Click();
    /// All live sweeps, as a recording that loads.
    void SpectrogramSave_Click();
    /// Shows a sweep as the trace until the next one comes; 0 is the newest.
    void showRow(int back);

  private:
    ControllerForm& panel_;
    const SweepHistory& history_;
    FileOps& files_;
    MessageBoxes& boxes_;
    Handlers handlers_;
};

}  // namespace zel
