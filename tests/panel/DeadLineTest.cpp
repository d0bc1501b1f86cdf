// An instrument that falls silent or dies in any handler, at any of its lines: the user hears of
// it, nothing stays stuck, and on a good line the panel goes on.

#include <algorithm>
#include <array>
#include <vector>

#include "tests/panel/DeadLine.h"

namespace zel {
namespace {

using Work = std::function<void(ControllerForm&)>;

Work click(Button CF::*key) {
    return [key](CF& panel) { (panel.*key).Click(); };
}
Work open(const Menu& menu) { return click(menu.key); }
Work check(CheckBox CF::*box) {
    return [box](CF& panel) { (panel.*box).Click(); };
}
Work soft(int key) {
    return [key](CF& panel) { panel.SoftKey(key).Click(); };
}
Work pick(int box, int choice) {
    return [box, choice](CF& panel) { panel.ChoiceBox(box).pick(choice); };
}
Work enter(int box, const std::string& text) {
    return [box, text](CF& panel) {
        panel.SoftBoxFirstKey = 2;
        panel.SoftTextBox(box).Text = text;
        int key = kKeyEnter;
        panel.SoftTextBox(box).KeyPress(key);
    };
}
Work both(const Work& first, const Work& second) {
    return [first, second](CF& panel) {
        first(panel);
        second(panel);
    };
}
void nothing(CF&) {}

const Work kTransducers = both(open(kMeas), soft(1));
const Work kLimits = both(open(kMeas), soft(2));
const Work kMarkers = both(check(&CF::MarkerCheckBox), click(&CF::MarkerButton));

std::vector<Handler> keys() {
    std::vector<Handler> all;
    // The connection has visited the frequency menu, and that of the span asks nothing.
    const std::pair<const char*, Button CF::*> hardKeys[] = {
        {"Amplitude", &CF::AmplitudeButton}, {"Bandwidth", &CF::BWButton},
        {"Sweep", &CF::SweepButton},         {"Trace", &CF::TraceButton},
        {"Meas", &CF::MeasButton},           {"Marker", &CF::MarkerButton},
    };
    for (const auto& [name, key] : hardKeys)
        all.push_back({std::string("Hard") + name, nothing, click(key)});
    const struct {
        const char* name;
        const Menu& menu;
        const char* failure;
    } modes[] = {
        {"Tracking", kTracking, "Tracking Generator Mode unsuccessful"},
        {"Power", kPower, "Power Sensor Mode unsuccessful"},
        {"ChannelPower", kChnPower, "Channer Power Mode unsuccessful"},
        {"OccupiedBandwidth", kOccBW, "Occupied Bandwidth Mode unsuccessful"},
        {"Tdma", kTdma, "TDMA Power unsuccessful"},
        {"DistanceToFault", kDtf, "Distance to Fault Mode unsuccessful"},
    };
    for (const auto& mode : modes)
        all.push_back({std::string("Mode") + mode.name, nothing, open(mode.menu), mode.failure});
    all.push_back(
        {"ModeAnalyzer", open(kTdma), click(&CF::AnalyzerButton), "Analyzer Mode unsuccessful"});
    all.push_back({"Preset", open(kTdma), click(&CF::ResetButton), "Analyzer Mode unsuccessful"});
    all.push_back({"Local", nothing, click(&CF::LocalButton)});
    all.push_back({"Remote", nothing, click(&CF::OnOffButton)});
    all.push_back({"PlaySingle", nothing, click(&CF::PlaySingleButton), "", true});
    all.push_back({"PlayPower", open(kPower), click(&CF::PlaySingleButton)});
    all.push_back({"ManualStatus", nothing, [](CF& panel) {
                       panel.ManualCommandText.Text = "GET";
                       panel.SendButton.Click();
                   }});
    all.push_back({"ManualData", nothing, [](CF& panel) {
                       panel.ManualCommandText.Text = "FREQ";
                       panel.SendButton.Click();
                   }});
    return all;
}

std::vector<Handler> softKeys() {
    const struct {
        const char* name;
        Work open;
        std::vector<int> keys;  // those that send something
    } menus[] = {
        {"Freq", open(kFreq), {0, 1, 2, 3, 4}},   {"Span", open(kSpan), {0, 1, 2, 3}},
        {"Ampt", open(kAmpt), {0, 1, 2, 3, 4}},   {"Bandwidth", open(kBW), {0, 1, 2, 3}},
        {"Sweep", open(kSweep), {0, 1, 2, 3, 4}}, {"Trace", open(kTrace), {0, 1}},
        {"Meas", open(kMeas), {0, 1, 2}},         {"Trd", kTransducers, {0, 1, 2, 3}},
        {"Limits", kLimits, {0, 1, 2}},           {"Tracking", open(kTracking), {0, 1, 2, 3, 4}},
        {"Power", open(kPower), {0, 1, 3, 4}},    {"ChnPower", open(kChnPower), {0, 1, 2, 3, 4}},
        {"OccBW", open(kOccBW), {0, 1, 2, 3}},    {"Tdma", open(kTdma), {0, 1, 2, 3}},
        {"Dtf", open(kDtf), {0, 1, 2, 3}},        {"Marker", kMarkers, {0, 1, 2}},
    };
    std::vector<Handler> all;
    for (const auto& menu : menus)
        for (const int key : menu.keys)
            all.push_back({std::string(menu.name) + std::to_string(key), menu.open, soft(key)});
    return all;
}

std::vector<Handler> entries() {
    return {
        {"Freq0", open(kFreq), enter(0, "1G")},
        {"Freq1", open(kFreq), enter(1, "100M")},
        {"Freq2", open(kFreq), enter(2, "1G")},
        {"Freq3", open(kFreq), enter(3, "2G")},
        {"Freq4", open(kFreq), enter(4, "1k")},
        {"Span0", open(kSpan), enter(0, "100M")},
        {"Span2", open(kSpan), enter(2, "0")},
        {"Ampt0", open(kAmpt), enter(0, "-30")},
        {"Ampt1", open(kAmpt), pick(1, 2)},
        {"Ampt2", open(kAmpt), pick(2, 1)},
        {"Ampt3", open(kAmpt), enter(3, "1")},
        {"Ampt4", open(kAmpt), pick(4, 1)},
        {"Bandwidth0", open(kBW), pick(0, 5)},
        {"Bandwidth2", open(kBW), pick(2, 5)},
        {"Sweep0", open(kSweep), enter(0, "100m")},
        {"Sweep1", open(kSweep), pick(1, 0)},
        {"Sweep2", open(kSweep), pick(2, 0)},
        {"Sweep3", open(kSweep), pick(3, 1)},
        {"Sweep4", open(kSweep), enter(4, "1m")},
        {"Trace0", open(kTrace), pick(0, 1)},
        {"Trace1", open(kTrace), pick(1, 1)},
        {"MeasTracking", open(kMeas), pick(0, 2), "Tracking Generator Mode unsuccessful"},
        {"MeasChannel", open(kMeas), pick(0, 4), "Channer Power Mode unsuccessful"},
        {"MeasFault", open(kMeas), pick(0, 7), "Distance to Fault Mode unsuccessful"},
        {"MeasReceiver", open(kMeas), pick(0, 8)},
        {"Trd0", kTransducers, enter(0, "ANT")},
        {"Trd1", kTransducers, enter(1, "ANT")},
        {"Limits0", kLimits, enter(0, "LOW")},
        {"Limits1", kLimits, enter(1, "UPP")},
        {"Tracking4", open(kTracking), enter(4, "-10")},
        {"Power1", open(kPower), enter(1, "1G")},
        {"Power3", open(kPower), pick(3, 1)},
        {"ChnPower0", open(kChnPower), enter(0, "1")},
        {"ChnPower1", open(kChnPower), pick(1, 2)},
        {"ChnPower2", open(kChnPower), pick(2, 1)},
        {"ChnPower3", open(kChnPower), enter(3, "1")},
        {"OccBW1", open(kOccBW), pick(1, 2)},
        {"OccBW2", open(kOccBW), enter(2, "2M")},
        {"Tdma1", open(kTdma), pick(1, 0)},
        {"Tdma2", open(kTdma), enter(2, "1")},
        {"Dtf0", open(kDtf), enter(0, "RG58C")},
        {"Dtf1", open(kDtf), enter(1, "20")},
        {"Dtf2", open(kDtf), pick(2, 1)},
        {"Dtf3", open(kDtf), enter(3, "m")},
        {"Marker0", kMarkers, enter(0, "1G")},
        {"Marker1", both(kMarkers, check(&CF::DeltaCheckBox)), enter(1, "1M")},
        {"Marker2", kMarkers, pick(2, 1)},
    };
}

std::vector<Handler> markerKeys() {
    const Work on = check(&CF::MarkerCheckBox);
    const Work delta = both(on, check(&CF::DeltaCheckBox));
    const char* const peak = "Could not set marker to peak!";
    const char* const centre = "Could not set the current marker as center frequency!";
    const char* const level = "Could not set the current marker to the Reference Level!";
    return {
        {"Peak", delta, click(&CF::MarkPkButton), peak},
        {"NextPeak", on, click(&CF::NextPeakButton), "Could not set marker to the next peak!"},
        {"Minimum", on, click(&CF::MinPeakButton), "Could not set marker to minimum!"},
        {"ToCentre", on, click(&CF::MarkToCentButton), centre},
        {"ToReference", on, click(&CF::MarkToRefButton), level},
        {"MarkerOn", nothing, on},
        {"MarkerOff", delta, on},
        {"DeltaOn", on, check(&CF::DeltaCheckBox)},
        {"DeltaOff", delta, check(&CF::DeltaCheckBox)},
        {"MenuWithBothOn", delta, click(&CF::MarkerButton)},
    };
}

/// All words that a line which fails may bring about, but for a handler's own.
const Texts kWords = {"No response received!", "Unsuccessful View",
                      "Port not open!",        "Not Connected To Port!",
                      "Port is not open!",     "Could not set Resolution Bandwidth to Auto"};

class DeadLine : public ::testing::TestWithParam<Handler> {
  protected:
    static void expectUsable(const CF& panel) {
        EXPECT_EQ(panel.MousePointer.get(), 0);
        EXPECT_TRUE(panel.GetOption.Value());
        EXPECT_FALSE(panel.SetOption.Value());
        EXPECT_FALSE(panel.ChoiceBoxActivated);
        EXPECT_FALSE(panel.ContinuosLoopActive);
        EXPECT_TRUE(panel.PlayContinuousButton.Visible);
        EXPECT_TRUE(panel.PlayContinuousButton.Enabled);
        EXPECT_EQ(panel.PlaySingleButton.Enabled || GetParam().leavesPlayDisabled, true);
        EXPECT_TRUE(panel.Connection.Enabled);
        EXPECT_TRUE(panel.Utility.Enabled);
        for (Button CF::*key :
             {&CF::FrequencyButton, &CF::MarkerButton, &CF::AnalyzerButton, &CF::TDMAButton,
              &CF::ResetButton, &CF::MarkPkButton, &CF::MarkToRefButton, &CF::SendButton})
            EXPECT_TRUE((panel.*key).Enabled);
    }
    static void expectTold(const DeadLineSetup& rig, int line, End end) {
        const Texts texts = rig.boxes.texts();
        // A transfer that comes short is drawn as far as it came.
        const bool quiet = end == End::Silent && rig.line.lastLine() == "TRACEBIN\r";
        EXPECT_TRUE(quiet || !texts.empty());
        for (const std::string& text : texts) {
            EXPECT_TRUE(text == GetParam().failure ||
                        std::find(kWords.begin(), kWords.end(), text) != kWords.end())
                << text;
        }
        if (line > 2 || GetParam().failure.empty()) return;
        EXPECT_NE(std::find(texts.begin(), texts.end(), GetParam().failure), texts.end());
    }
    /// The key of the frequency menu asks, and is answered.
    static void expectWorksAgain(DeadLineSetup& rig) {
        std::string measurement;
        EXPECT_TRUE(rig.answers(measurement));
        const int mode = static_cast<int>(rig.instrument.device().settings().measurement());
        EXPECT_EQ(measurement, std::to_string(mode));
        rig.panel.PlaySingleButton.Click();
        EXPECT_TRUE(rig.panel.PlaySingleButton.Enabled);
        EXPECT_EQ(rig.panel.MousePointer.get(), 0);
    }
};

TEST_P(DeadLine, Handler_TellsItAndLeavesThePanelUsable) {
    int lines = 0;
    {
        DeadLineSetup good;
        GetParam().ready(good.panel);
        good.line.failAt(0, End::Silent);
        GetParam().work(good.panel);
        lines = good.line.lines();
    }
    ASSERT_GT(lines, 0);
    for (const End end : {End::Silent, End::Dead}) {
        for (int line = 1; line <= lines; ++line) {
            SCOPED_TRACE((end == End::Silent ? "silent at line " : "dead at line ") +
                         std::to_string(line));
            DeadLineSetup rig;
            GetParam().ready(rig.panel);
            rig.boxes.clear();
            rig.line.failAt(line, end);
            GetParam().work(rig.panel);
            ASSERT_TRUE(rig.line.failed());
            expectUsable(rig.panel);
            expectTold(rig, line, end);
            rig.line.mend();
            if (end == End::Dead) {
                rig.program.disconnect();
                rig.connect();
            }
            expectWorksAgain(rig);
            if (HasFailure()) return;
        }
    }
}

const auto kName = [](const auto& tested) { return tested.param.name; };

INSTANTIATE_TEST_SUITE_P(Keys, DeadLine, ::testing::ValuesIn(keys()), kName);
INSTANTIATE_TEST_SUITE_P(SoftKeys, DeadLine, ::testing::ValuesIn(softKeys()), kName);
INSTANTIATE_TEST_SUITE_P(Entries, DeadLine, ::testing::ValuesIn(entries()), kName);
INSTANTIATE_TEST_SUITE_P(Markers, DeadLine, ::testing::ValuesIn(markerKeys()), kName);

class DeadLineInTheView : public ::testing::TestWithParam<End> {};

TEST_P(DeadLineInTheView, Stop_IsTheWayBack) {
    constexpr int kLinesOfThreePasses = 26;
    for (int line = 1; line <= kLinesOfThreePasses; ++line) {
        SCOPED_TRACE("line " + std::to_string(line));
        DeadLineSetup rig;
        rig.boxes.clear();
        rig.line.failAt(line, GetParam());
        rig.panel.PlayContinuousButton.Click();  // comes back by itself
        ASSERT_TRUE(rig.line.failed());
        EXPECT_FALSE(rig.boxes.texts().empty());
        if (GetParam() == End::Silent) {
            EXPECT_EQ(rig.boxes.texts().size(), 1U);
        }
        EXPECT_FALSE(rig.panel.ContinuosLoopActive);
        EXPECT_TRUE(rig.panel.LinkLost);
        EXPECT_TRUE(rig.panel.StopButton.Visible);
        EXPECT_EQ(rig.panel.MousePointer.get(), 0);
        rig.panel.StopButton.Click();
        EXPECT_FALSE(rig.panel.StopButton.Visible);
        EXPECT_TRUE(rig.panel.PlayContinuousButton.Visible);
        EXPECT_TRUE(rig.panel.Connection.Enabled);
        EXPECT_TRUE(rig.panel.Utility.Enabled);
        rig.line.mend();
        if (GetParam() == End::Dead) {
            rig.program.disconnect();
            rig.connect();
        }
        rig.platform.events.schedule(100, [&rig] { rig.panel.StopButton.Click(); });
        rig.panel.PlayContinuousButton.Click();
        EXPECT_TRUE(rig.panel.Connection.Enabled);
        EXPECT_TRUE(rig.panel.Utility.Enabled);
        EXPECT_TRUE(rig.panel.PlaySingleButton.Enabled);
        if (HasFailure()) return;
    }
}

INSTANTIATE_TEST_SUITE_P(Ends, DeadLineInTheView, ::testing::Values(End::Silent, End::Dead),
                         [](const auto& tested) {
                             return std::string(tested.param == End::Silent ? "Silent" : "Dead");
                         });

}  // namespace
}  // namespace zel
