#include "bench/PanelWork.h"

#include <QApplication>
#include <cstddef>
#include <stdexcept>
#include <string>
#include <vector>

#include "bench/BareLine.h"
#include "bench/CoreSession.h"
#include "bench/Figures.h"
#include "bench/Process.h"
#include "desktop/windows/MainWindow.h"
#include "forms/ControllerForm.h"
#include "platform/Controls.h"
#include "platform/Event.h"
#include "platform/KeyInput.h"

namespace zelbench {
namespace {

constexpr int kBaud = 57600;
constexpr int kRounds = 15;
constexpr int kSettings = 40;  // a round
constexpr int kWarmUp = 5;     // passes
constexpr int kPacedPasses = 12;
constexpr int kUnpacedPasses = 300;  // a round
constexpr double kAllowed = 5e-3;    // seconds

/// The program with its window, connected.
struct OpenPanel {
    explicit OpenPanel(const std::string& device)
        : session(device, kBaud), window(session.program()) {
        window.resize(1280, 760);
        window.show();
        QApplication::processEvents();
    }
    void paint() {
        window.graph().drawNow();
        window.graph().repaint();
    }

    CoreSession session;
    zel::ControllerForm& panel = session.program().forms().controller;
    zel::MainWindow window;
};

const char* frequencyOf(int i) { return i % 2 == 0 ? "900000000" : "1800000000"; }

struct Passes {
    double seconds = 0;  ///< a pass
    double bytes = 0;    ///< a pass, both ways
};

/// The window of the waterfall and the spectrogram, both seen.
void openRows(OpenPanel& desk) {
    desk.panel.SpectrogramShow.Click();
    desk.panel.cmd3D.Click();
    QApplication::processEvents();
}

/// Runs the continuous view for so many passes after the warm-up.
Passes runView(OpenPanel& desk, int passes) {
    int plots = 0;
    double start = 0;
    double end = 0;
    std::size_t before = 0;
    std::size_t after = 0;
    unsigned long serial = desk.panel.CWGraph1.plotSerial();
    bool counting = true;
    zel::Handlers handlers;
    handlers.on(desk.panel.CWGraph1.Changed, [&, &graph = desk.panel.CWGraph1] {
        if (!counting || graph.plotSerial() == serial) return;
        serial = graph.plotSerial();
        ++plots;
        if (plots == kWarmUp) {
            start = now();
            before = desk.session.bytes();
        }
        if (plots != kWarmUp + passes) return;
        end = now();
        after = desk.session.bytes();
        counting = false;
        desk.panel.StopButton.Click();
    });
    desk.panel.PlayContinuousButton.Click();
    if (counting) throw std::runtime_error("the continuous view ended early");
    return {(end - start) / passes, static_cast<double>(after - before) / passes};
}

}  // namespace

Figure settingCost(const std::string& simulator) {
    const Simulator instrument(simulator, {"--speed", "1000000"});
    std::vector<double> extra;
    std::vector<double> whole;
    std::vector<double> bare;
    for (int round = 0; round < kRounds; ++round) {
        double least = 0;
        std::size_t leastBytes = 0;
        {
            BareLine line(instrument.device(), kBaud);
            const std::size_t before = line.bytes();
            least = timeOf([&] {
                for (int i = 0; i < kSettings; ++i) {
                    line.set(std::string("FREQ,") + frequencyOf(i));
                    line.get("SPAN");  // a centre near an edge narrows it
                    line.pass();
                }
            });
            leastBytes = line.bytes() - before;
        }
        OpenPanel desk(instrument.device());
        desk.panel.FrequencyButton.Click();
        zel::TextBox& box = desk.panel.SoftTextBox(0);
        const std::size_t before = desk.session.bytes();
        const double full = timeOf([&] {
            for (int i = 0; i < kSettings; ++i) {
                zel::typeText(box, frequencyOf(i));
                zel::typeKey(box, zel::kKeyEnter);
                desk.paint();
            }
        });
        if (desk.session.bytes() - before != leastBytes) {
            throw std::runtime_error(
                "the two loops differ in bytes: " + std::to_string(desk.session.bytes() - before) +
                " and " + std::to_string(leastBytes));
        }
        whole.push_back(full / kSettings);
        bare.push_back(least / kSettings);
        extra.push_back((full - least) / kSettings);
    }
    return {"(g) a setting, Enter to the new trace drawn, beyond its dialogue",
            timeText(median(whole)) + " less " + timeText(median(bare)),
            timeText(kAllowed),
            median(extra) / kAllowed,
            1,
            false,
            ""};
}

Figure menusAgain(const std::string& simulator) {
    const Simulator instrument(simulator, {"--speed", "1000000"});
    OpenPanel desk(instrument.device());
    zel::ControllerForm& panel = desk.panel;
    // The sweep key and the marker key ask how things stand each time they are pressed.
    zel::Button* const keys[] = {&panel.FrequencyButton, &panel.SpanButton,  &panel.AmplitudeButton,
                                 &panel.BWButton,        &panel.TraceButton, &panel.MeasButton};
    std::size_t bytes[2] = {0, 0};
    double seconds[2] = {0, 0};
    for (int use = 0; use < 2; ++use) {
        for (zel::Button* key : keys) {
            const std::size_t before = desk.session.bytes();
            seconds[use] += timeOf([&] { key->Click(); });
            bytes[use] += desk.session.bytes() - before;
        }
    }
    if (bytes[0] == 0) throw std::runtime_error("the first use asked nothing");
    return {"(h) six menu keys, second use",
            std::to_string(bytes[1]) + " bytes, " + timeText(seconds[1]),
            "first use, " + std::to_string(bytes[0]) + " bytes, " + timeText(seconds[0]),
            static_cast<double>(bytes[1]) / static_cast<double>(bytes[0]),
            1e-9,
            false,
            ""};
}

Figure continuousPaced(const std::string& simulator) {
    const Simulator instrument(simulator, {"--baud", std::to_string(kBaud), "--speed", "1000000"});
    OpenPanel desk(instrument.device());
    const Passes passes = runView(desk, kPacedPasses);
    const double possible = passes.bytes * 10 / kBaud;
    return {"(i) continuous view at 57,600 baud, drawn",
            timeText(passes.seconds),
            numberText(passes.bytes) + " bytes, " + timeText(possible),
            possible / passes.seconds,
            0.97,
            true,
            ""};
}

Figure continuousUnpaced(const std::string& simulator) {
    const Simulator instrument(simulator, {"--speed", "1000000"});
    std::vector<double> ratios;
    std::vector<double> core;
    std::vector<double> bare;
    for (int round = 0; round < kRounds; ++round) {
        double least = 0;
        {
            BareLine line(instrument.device(), kBaud);
            for (int i = 0; i < kWarmUp; ++i) line.pass();
            least = timeOf([&] {
                        for (int i = 0; i < kUnpacedPasses; ++i) line.pass();
                    }) /
                    kUnpacedPasses;
        }
        OpenPanel desk(instrument.device());
        const Passes passes = runView(desk, kUnpacedPasses);
        core.push_back(1 / passes.seconds);
        bare.push_back(1 / least);
        ratios.push_back(least / passes.seconds);
    }
    return {"(i) continuous view, unpaced pty, drawn",
            numberText(median(core)) + " sweeps/s",
            "bare loop, " + numberText(median(bare)) + " sweeps/s",
            median(ratios),
            0.7,
            true,
            ""};
}

Figure rowsPaced(const std::string& simulator) {
    const Simulator instrument(simulator, {"--baud", std::to_string(kBaud), "--speed", "1000000"});
    OpenPanel desk(instrument.device());
    openRows(desk);
    const Passes passes = runView(desk, kPacedPasses);
    const double possible = passes.bytes * 10 / kBaud;
    return {"(n) continuous view at 57,600 baud, waterfall and spectrogram open",
            timeText(passes.seconds),
            numberText(passes.bytes) + " bytes, " + timeText(possible),
            possible / passes.seconds,
            0.97,
            true,
            ""};
}

Figure rowsUnpaced(const std::string& simulator) {
    const Simulator instrument(simulator, {"--speed", "1000000"});
    std::vector<double> ratios;
    std::vector<double> open;
    std::vector<double> closed;
    for (int round = 0; round < kRounds; ++round) {
        {
            OpenPanel desk(instrument.device());
            closed.push_back(1 / runView(desk, kUnpacedPasses).seconds);
        }
        OpenPanel desk(instrument.device());
        openRows(desk);
        open.push_back(1 / runView(desk, kUnpacedPasses).seconds);
        ratios.push_back(open.back() / closed.back());
    }
    return {"(n) continuous view, unpaced pty, waterfall and spectrogram open",
            numberText(median(open)) + " sweeps/s",
            "both closed, " + numberText(median(closed)) + " sweeps/s",
            median(ratios),
            0.5,
            true,
            ""};
}

}  // namespace zelbench
