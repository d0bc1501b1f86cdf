#pragma once
// Pictures of the spectrogram in files.

#include <QSize>
#include <QString>

#include "forms/WaterfallForm.h"
#include "waterfall/SweepHistory.h"

namespace zel {

/// All sweeps that are kept, the newest at the top, with axes, times and the colour bar. png, svg
/// or pdf by the ending; pdf has light colours. False with a text in `error`; an older file is then
/// as it was.
bool saveSpectrogramImage(const WaterfallForm& form, const SweepHistory& history,
                          const QString& path, QString* error, QSize size = {1000, 620},
                          bool dark = true);

}  // namespace zel
