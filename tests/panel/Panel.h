#pragma once
// A connected session that works the panel's menus.

#include <cstdint>
#include <string>
#include <type_traits>
#include <vector>

#include "tests/Session.h"

namespace zel {

using CF = ControllerForm;
using Texts = std::vector<std::string>;

/// A menu by its key; a mode's menu comes with its mode.
struct Menu {
    Button CF::*key = nullptr;
    std::int16_t mode = CF::ANALYZER;
    std::int16_t state = 0;
};

inline constexpr Menu kFreq{&CF::FrequencyButton, CF::ANALYZER, CF::Freq};
inline constexpr Menu kSpan{&CF::SpanButton, CF::ANALYZER, CF::SPAN};
inline constexpr Menu kAmpt{&CF::AmplitudeButton, CF::ANALYZER, CF::AMPT};
inline constexpr Menu kBW{&CF::BWButton, CF::ANALYZER, CF::BW};
inline constexpr Menu kSweep{&CF::SweepButton, CF::ANALYZER, CF::SWEEP};
inline constexpr Menu kTrace{&CF::TraceButton, CF::ANALYZER, CF::TRACE};
inline constexpr Menu kMeas{&CF::MeasButton, CF::ANALYZER, CF::MEAS};
inline constexpr Menu kTracking{&CF::TrackButton, CF::TRACKINGGENERATOR, CF::TRACKINGGEN};
inline constexpr Menu kPower{&CF::PwrButton, CF::POWERSENSOR, CF::POWER};
inline constexpr Menu kChnPower{&CF::ChnPwrButton, CF::CHANNELPOWER, CF::CHNPOWER};
inline constexpr Menu kOccBW{&CF::OccBWButton, CF::OCCBANDWIDTH, CF::OCCBW};
inline constexpr Menu kTdma{&CF::TDMAButton, CF::TDMAPOWERMODE, CF::TDMA};
inline constexpr Menu kDtf{&CF::DistFaultButton, CF::DISTTOFAULTMEASURE, CF::DISTFAULT};

inline const char* const kNotConnected = "Please connect to the intrument first.";
inline const char* const kContinuousView =
    "Please exit the continuous View Mode first\r\n"
    "Use the red stop button in the upper right corner.";

struct PanelSession : TestSession {
    PanelSession() {
        startConnected();
        mirror.TraceDetector = 3;
    }
    /// Every menu was visited before: it shows the mirror and asks nothing.
    void visited() { mirror.MenuVisitCount.fill(2); }
    void open(const Menu& menu) {
        visited();
        panel.InstrumentMode = menu.mode;
        if (menu.state == CF::SWEEP) panel.isConnected = false;  // it would ask for its time
        (panel.*menu.key).Click();
        panel.isConnected = true;
        EXPECT_EQ(panel.State, menu.state);
        EXPECT_EQ(port.written(), "");
    }
    /// A field of the mirror as a number.
    double field(const std::string& name) const {
        for (const Variable& variable : variablesOf(mirror)) {
            if (variable.name != name) continue;
            return std::visit(
                [](const auto* value) -> double {
                    if constexpr (std::is_arithmetic_v<std::remove_cvref_t<decltype(*value)>>)
                        return static_cast<double>(*value);
                    return -1;
                },
                variable.value);
        }
        ADD_FAILURE() << "no field " << name;
        return -1;
    }
    void sweep() {
        cmd("WAIT");
        trace(levelBlock(-35250));
    }
    void type(int box, const std::string& text) {
        panel.SoftBoxFirstKey = 2;
        panel.SoftTextBox(box).Text = text;
    }
    void enter(int box) {
        int key = kKeyEnter;
        panel.SoftTextBox(box).KeyPress(key);
    }
};

}  // namespace zel
