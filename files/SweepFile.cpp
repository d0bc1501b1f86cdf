#include "files/SweepFile.h"

#include <cstddef>
#include <string>
#include <vector>

#include "files/OutputFile.h"
#include "files/ViewHeader.h"
#include "platform/Clock.h"
#include "platform/Files.h"
#include "support/NumberText.h"
#include "trace/Sweep.h"

namespace zel {
namespace {

constexpr const char* kXFormat = "#.000";

}  // namespace

double writeSweepRows(OutputFile& file, const Sweep& sweep) {
    const SweepAxis& axis = sweep.axis;
    const bool zeroSpan = sweep.settings.Span == 0;
    const double step =
        zeroSpan || axis.intervals == 0 ? 0 : (axis.stop - axis.start) / axis.intervals;
    const std::vector<double>& values = sweep.physical;
    const bool pairs = sweep.autoPeak();
    double x = zeroSpan ? 0 : axis.start;
    for (std::size_t i = 0; i < values.size(); i += pairs ? 2 : 1) {
        if (i > 0) x += step;
        std::string& text = file.text();
        text += formatPattern(x, kXFormat);
        text += ';';
        text += generalNumber(values[i]);
        if (!pairs) {
            file.line("; ");
        } else {
            text += ';';
            file.line(i + 1 < values.size() ? generalNumber(values[i + 1]) : "0");
        }
    }
    return x;
}

std::string appendSweep(FileService& files, const std::string& path, const Sweep& sweep,
                        const Clock& clock) {
    OutputFile file(files, path, OutputFile::Mode::Append);
    ViewHeader{sweep.settings, sweep.instrumentMode, sweep.settings, clock, [](const char*) {}}
        .write(file);
    writeSweepRows(file, sweep);
    return file.close();
}

}  // namespace zel
