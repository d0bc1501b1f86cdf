#pragma once
// A session with a folder of its own for files, and traces to put into them.

#include <string>
#include <vector>

#include "tests/Session.h"
#include "trace/TraceConversion.h"

namespace zel {

using Texts = std::vector<std::string>;

/// A folder on the disk in memory.
class Folder {
  public:
    explicit Folder(VirtualFiles& disk) : disk_(disk) { disk_.putFolder(kPath); }

    std::string file(const std::string& name) const { return std::string(kPath) + "/" + name; }
    std::string read(const std::string& name) const { return disk_.bytes(file(name)); }
    std::string write(const std::string& name, const std::string& text) const {
        disk_.put(file(name), text);
        return file(name);
    }
    bool has(const std::string& name) const { return disk_.has(file(name)); }

  private:
    static constexpr const char* kPath = "/views";
    VirtualFiles& disk_;
};

/// Without their CR LF; a last line that is not ended counts.
inline Texts linesOf(const std::string& text) {
    Texts lines;
    std::size_t start = 0;
    for (std::size_t end = 0; (end = text.find("\r\n", start)) != std::string::npos;
         start = end + 2)
        lines.push_back(text.substr(start, end - start));
    if (start < text.size()) lines.push_back(text.substr(start));
    return lines;
}

struct FileSession : TestSession {
    explicit FileSession(const std::string& commandLine = "") : TestSession(commandLine) {
        program.start();
        mirror.ResolutionBandwidth = 7;
        mirror.VideoBandwidth = 9;
        // A series that never ends would be a test that never ends.
        panel.TraceLoaded.connect([this, shown = 0]() mutable {
            if (++shown > 5000) panel.StopButton.Click();
        });
    }

    /// A trace of these raw samples is on the graph, as after a read cycle.
    void sweepOf(const std::vector<double>& samples) {
        Sweep& sweep = program.sweep();
        sweep = {};
        sweep.raw = samples;
        sweep.wanted = sweep.came = samples.size();
        sweep.settings = mirror;
        sweep.instrumentMode = panel.InstrumentMode;
        if (mirror.Span == 0) {
            sweep.axis.stop = mirror.SweepTime;
        } else {
            sweep.axis.start = mirror.CenterFrequency - mirror.Span / 2;
            sweep.axis.stop = mirror.CenterFrequency + mirror.Span / 2;
        }
        placePoints(sweep);
        panel.ViewStart = sweep.axis.start;
        panel.ViewStop = sweep.axis.stop;
        TraceConversion conversion(panel, forms.waterfall.Graph3D);
        TraceConversion::SelectRawScale(sweep);
        conversion.ConvertTrace(sweep);
    }
    const std::vector<double>& drawn() { return program.sweep().shown; }
    /// From 1.4995 GHz to 1.5005 GHz.
    void narrowSpan() {
        mirror.CenterFrequency = 1.5e9;
        mirror.Span = 1e6;
        mirror.SweepTime = 0.02;
        mirror.ReferenceLevel = -20;
    }
    /// 301 samples (602 with auto peak) that fall from the first value by the step.
    static std::vector<double> ramp(double first, double step, std::size_t count = 301) {
        std::vector<double> samples(count);
        for (std::size_t i = 0; i < count; ++i) samples[i] = first + static_cast<double>(i) * step;
        return samples;
    }
    /// Saves through the menu entry.
    std::string save(const std::string& name) {
        platform.fileDialogs.answer(folder.file(name));
        panel.SaveCurrentView.Click();
        return folder.read(name);
    }
    Texts header(const std::string& name = "view.csv") {
        Texts lines = linesOf(save(name));
        Texts head;
        for (const std::string& line : lines) {
            if (line.empty()) break;
            head.push_back(line);
        }
        return head;
    }
    /// The value of a header line; "-" when there is no such line.
    std::string entry(const std::string& name) {
        for (const std::string& line : header())
            if (line.compare(0, name.size() + 1, name + ";") == 0)
                return line.substr(name.size() + 1);
        return "-";
    }
    void open(const std::string& name) { panel.OpenFile(folder.file(name)); }

    Folder folder{platform.files};
};

}  // namespace zel
