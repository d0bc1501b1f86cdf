#include <gtest/gtest.h>

#include <array>
#include <string>
#include <vector>

#include "panel/SoftPanel.h"
#include "tests/panel/Panel.h"

namespace zel {
namespace {

/// What a position shows: B box, L locked box, C choice, c locked choice, X box with the list
/// above it, - nothing.
struct LayoutRow {
    const char* name;
    Menu menu;
    std::array<const char*, 5> captions;  // an empty one is a hidden key
    std::array<const char*, 5> frames;    // null where the frame is hidden or keeps its caption
    const char* kinds;
    std::array<const char*, 5> choices;  // joined by "|"
};

void PrintTo(const LayoutRow& row, std::ostream* out) { *out << row.name; }

const char* const kStandards = "User|3GPP WCDMA|cmdaOne|cdma2000 1x";

const LayoutRow kLayouts[] = {
    {"Freq",
     kFreq,
     {"CENTER\r\nFREQ", "MANUAL\r\nSPAN", "START\r\nFREQ", "STOP\r\nFREQ", "FREQ\r\nOFFSET"},
     {"Frequency", "Span", "Start Freq", "Stop Freq", "Freq Offset"},
     "BBBBB",
     {}},
    {"Span",
     kSpan,
     {"MANUAL\r\nSPAN", "FULL\r\nSPAN", "ZERO\r\nSPAN", "LAST\r\nSPAN", ""},
     {"Span"},
     "B----",
     {}},
    {"Amplitude",
     kAmpt,
     {"REF\r\nLEVEL", "RANGE", "UNIT", "REF\r\nOFFSET", "RF INPUT"},
     {"Ref Level", "Range", "Unit", "Ref Level Offset", "RF Input"},
     "BCCXC",
     {"", "10dB/DIV|5dB/DIV|2dB/DIV|1dB/DIV|LIN 0-100%|VSWR 1-6|VSWR 1-2",
      "dBm|dBmV|dBµV|dBµV/m|dBµA/m|dB|Volt|Watt", "50 Ohm|75 Ohm", "50 Ohm|75 Ohm"}},
    {"Bandwidth",
     kBW,
     {"MANUAL\r\nRES BW", "AUTO\r\nRES  BW", "MANUAL\r\nVID BW", "AUTO\r\nVID BW", ""},
     {"Res Bandwidth", "Value", "Vid Bandwidth", "Value"},
     "CLCL-",
     {"Auto|100 Hz|300 Hz|1 kHz|3 kHz|10 kHz|30 kHz|100 kHz|300 kHz|1 MHz", "",
      "Auto|10 Hz|30 Hz|100 Hz|300 Hz|1 kHz|3 kHz|10 kHz|30 kHz|100 kHz|300 kHz|1 MHz|3 MHz"}},
    {"Sweep",
     kSweep,
     {"MANUAL\r\nSWPTIME", "AUTO\r\nSWPTIME", "SWEEP\r\nMODE", "TRIGGER", "TRIGGER\r\nDELAY"},
     {"Swp Time", "Auto Swp", "Swp Mode", nullptr, "Lev/Del"},
     "BcCCB",
     {"", "On|Off", "Single|Continuous", "Free Run|Video|Ext - Rise|Ext - Fall|Delay"}},
    {"Trace",
     kTrace,
     {"TRACE\r\nMODE", "DETECTOR", "", "", ""},
     {"Trace Mode", "Detector"},
     "CC---",
     {"Clear Write|Average|Max Hold|Min Hold|View", "Auto Peak|Min Peak|Max Peak|Sample|RMS"}},
    {"Measurement",
     kMeas,
     {"MEASURE", "TRANS\r\nDUCER", "LIMIT\r\nLINES", "DISPLAY\r\nLINE", ""},
     {"Meas Mode", "Transducer", "Limit Lines"},
     "CLL--",
     {"Off|Analyzer|Tracking Gen|Pwr Sensor|Chn Power|Occ Bandwidth|TDMA Pwr|Dist to Fault|"
      "Receiver"}},
    {"Tracking",
     kTracking,
     {"TRANS\r\nCAL", "REFLECT\r\nCAL", "TRANSM\r\nVECT CAL", "REFLECT\r\nVECT CAL",
      "TRACGEN\r\nLEVEL"},
     {"Transm Calibr", "Refl Calibr", "TrVector Calibr", "TrReflVector Calibr", "TrackingGen Lvl"},
     "LLLLL",
     {}},
    {"Power",
     kPower,
     {"POWER", "FREQ", "POWER-\r\nREF", "MEAS\r\nTIME", "REFL\r\nLEVEL"},
     {"Pwr Level", "Frequency", nullptr, "Meas Time", "Refl Lvl"},
     "LB-CL",
     {"", "", "", "Short|Normal|Long"}},
    {"ChannelPower",
     kChnPower,
     {"CHN\r\nPOWER", "CHN\r\nPWRSTD", "CHN\r\nPWRUNIT", "CHN\r\nPWRBW", "LEVEL\r\nADJ"},
     {"Chn Power", "ChnPwr Std", "ChnPwr Unit", "ChnPwr BW"},
     "LCCB-",
     {"", kStandards, "dBm|dBmV|dBµV"}},
    {"OccupiedBandwidth",
     kOccBW,
     {"OCCUP\r\nBW", "OCCBW\r\nSTD", "OCCBW\r\nCHNBW", "LVL\r\nADJ", ""},
     {"Occ BW", "Occ Bw Std", "OccBw ChnBw"},
     "LCB--",
     {"", kStandards}},
    {"Tdma",
     kTdma,
     {"TDMA\r\nPOWER", "TDMA\r\nPWRSTD", "MEAS\r\nTIME", "LVL\r\nADJ", ""},
     {"TDMA Pwr", "TDMA Standard", "Meas Time"},
     "LCB--",
     {"", "User|GSM/EDGE"}},
    {"DistanceToFault",
     kDtf,
     {"CABLE\r\nMODEL", "CABLE\r\nLEN", "DTF\r\nMODE", "LEN\r\nUNIT", ""},
     {"Cable Model", "Cable Length", "DTF Power", "Unit Length"},
     "BBCB-",
     {"", "", "DTF|Reflection|Spectrum"}},
};

class MenuLayout : public PanelSession, public ::testing::TestWithParam<LayoutRow> {
  public:
    MenuLayout() { open(GetParam().menu); }
};

TEST_P(MenuLayout, Keys_HaveTheirCaptionsOrAreHidden) {
    for (int i = 0; i < 5; ++i) {
        const std::string caption = GetParam().captions[static_cast<std::size_t>(i)];
        EXPECT_EQ(panel.SoftKey(i).Visible.get(), !caption.empty()) << "key " << i;
        if (!caption.empty()) {
            EXPECT_EQ(panel.SoftKey(i).Caption.get(), caption);
        }
    }
}

TEST_P(MenuLayout, Positions_ShowBoxOrListOrNothing) {
    for (int i = 0; i < 5; ++i) {
        const char kind = GetParam().kinds[i];
        const bool box = kind == 'B' || kind == 'L' || kind == 'X';
        const bool list = kind == 'C' || kind == 'c' || kind == 'X';
        EXPECT_EQ(panel.SoftTextBox(i).Visible.get(), box) << "position " << i;
        EXPECT_EQ(panel.ChoiceBox(i).Visible.get(), list) << "position " << i;
        if (box) {
            EXPECT_EQ(panel.SoftTextBox(i).Locked.get(), kind == 'L') << "position " << i;
        }
        if (list) {
            EXPECT_EQ(panel.ChoiceBox(i).Locked.get(), kind == 'c') << "position " << i;
        }
    }
}

TEST_P(MenuLayout, Frames_HaveTheirCaptions) {
    for (int i = 0; i < 5; ++i) {
        const char* frame = GetParam().frames[static_cast<std::size_t>(i)];
        if (frame == nullptr) continue;
        EXPECT_EQ(panel.SoftFrame(i).Caption.get(), frame) << "position " << i;
        EXPECT_TRUE(panel.SoftFrame(i).Visible) << "position " << i;
    }
}

TEST_P(MenuLayout, Lists_HoldTheirEntries) {
    for (int i = 0; i < 5; ++i) {
        const char* wanted = GetParam().choices[static_cast<std::size_t>(i)];
        std::string joined;
        for (const std::string& item : panel.ChoiceBox(i).items())
            joined += (joined.empty() ? "" : "|") + item;
        EXPECT_EQ(joined, wanted == nullptr ? "" : wanted) << "position " << i;
    }
}

INSTANTIATE_TEST_SUITE_P(Menus, MenuLayout, ::testing::ValuesIn(kLayouts),
                         [](const auto& tested) { return std::string(tested.param.name); });

struct LayoutTest : PanelSession, ::testing::Test {};

TEST_F(LayoutTest, Bandwidth_PaintsTheAutoKeysGreen) {
    open(kBW);
    EXPECT_EQ(panel.SoftKey(1).BackColor.get(), kGreen);
    EXPECT_EQ(panel.SoftKey(3).BackColor.get(), kGreen);
    EXPECT_EQ(panel.SoftKey(0).BackColor.get(), kRed);
    EXPECT_EQ(panel.SoftKey(2).BackColor.get(), kButtonFace);
}

TEST_F(LayoutTest, Measurement_DisablesItsFourthKey) {
    open(kMeas);
    EXPECT_FALSE(panel.SoftKey(3).Enabled);
    open(kFreq);
    EXPECT_TRUE(panel.SoftKey(3).Enabled);
}

TEST_F(LayoutTest, Power_DisablesItsThirdKey) {
    open(kPower);
    EXPECT_FALSE(panel.SoftKey(2).Enabled);
    EXPECT_TRUE(panel.SoftKey(1).Enabled);
    EXPECT_TRUE(panel.SoftKey(4).Visible);
}

TEST_F(LayoutTest, Trace_HiddenThirdKey_KeepsItsCaption) {
    open(kTrace);
    EXPECT_FALSE(panel.SoftKey(2).Visible);
    EXPECT_EQ(panel.SoftKey(2).Caption.get(), "TRACE");
}

TEST_F(LayoutTest, HiddenLevelKeyOfTheModes_KeepsItsCaption) {
    for (const Menu& menu : {kOccBW, kTdma, kDtf}) {
        open(menu);
        EXPECT_FALSE(panel.SoftKey(4).Visible);
        EXPECT_EQ(panel.SoftKey(4).Caption.get(), "LEVEL\r\nADJ");
    }
}

TEST_F(LayoutTest, Sweep_FrameOfTheTriggerKeepsItsEarlierCaption) {
    open(kFreq);
    open(kSweep);
    EXPECT_EQ(panel.SoftFrame(3).Caption.get(), "Stop Freq");
    EXPECT_TRUE(panel.SoftFrame(3).Visible);
}

TEST_F(LayoutTest, NewMenu_RemembersTheStateBefore) {
    open(kSpan);
    open(kBW);
    EXPECT_EQ(panel.LastState, CF::SPAN);
}

TEST_F(LayoutTest, SubMenuOfTransducers_IsTypedAndHasItsKeys) {
    open(kMeas);
    get("TRD2", "0");  // the key's number counts in the new menu at once
    panel.SoftKey(1).Click();
    expectPlayed();
    EXPECT_EQ(panel.State, CF::MEAS_TRD);
    const char* captions[] = {"TRANSD", "TRANSD\r\ndB", "TRANSD1\r\nOff", "TRANSD2\r\nOff", "EXIT"};
    for (int i = 0; i < 5; ++i) {
        EXPECT_EQ(panel.SoftKey(i).Caption.get(), captions[i]);
        EXPECT_TRUE(panel.SoftKey(i).Visible && panel.SoftKey(i).Enabled);
        EXPECT_EQ(panel.SoftTextBox(i).Visible.get(), i < 2);
        EXPECT_EQ(panel.SoftFrame(i).Visible.get(), i < 2);
        EXPECT_FALSE(panel.ChoiceBox(i).Visible);
    }
    EXPECT_EQ(panel.SoftFrame(0).Caption.get(), "Transducer");
    EXPECT_EQ(panel.SoftFrame(1).Caption.get(), "Transducer Db");
    EXPECT_FALSE(panel.SoftTextBox(0).Locked);
}

TEST_F(LayoutTest, SubMenuOfLimits_IsTypedAndHasItsKeys) {
    open(kMeas);
    get("LIMPASS", "2");
    panel.SoftKey(2).Click();
    expectPlayed();
    EXPECT_EQ(panel.State, CF::MEAS_LLINES);
    const char* captions[] = {"LOWER\r\nLIMIT", "UPPER\r\nLIMIT", "LIMITS\r\nPASSED", "EXIT"};
    for (int i = 0; i < 4; ++i) EXPECT_EQ(panel.SoftKey(i).Caption.get(), captions[i]);
    EXPECT_FALSE(panel.SoftKey(4).Visible);
    const char* frames[] = {"Lower Limit", "Upper Limit", "Limits Passed"};
    for (int i = 0; i < 3; ++i) EXPECT_EQ(panel.SoftFrame(i).Caption.get(), frames[i]);
    EXPECT_TRUE(panel.SoftTextBox(0).Visible && panel.SoftTextBox(1).Visible);
    EXPECT_FALSE(panel.ChoiceBox(0).Visible || panel.ChoiceBox(1).Visible);
    EXPECT_EQ(panel.ChoiceBox(2).items(), (Texts{"Unknown", "Failed", "Passed"}));
    EXPECT_TRUE(panel.ChoiceBox(2).Locked);
    EXPECT_EQ(panel.ChoiceBox(2).Text(), "Passed");
    EXPECT_EQ(panel.SoftTextBox(2).Text.get(), "Passed (2)");
}

TEST_F(LayoutTest, ExitKeys_GoBackToTheMeasurementMenu) {
    open(kMeas);
    get("TRD2", "0");
    panel.SoftKey(1).Click();
    panel.SoftKey(4).Click();
    EXPECT_EQ(panel.State, CF::MEAS);
    get("LIMPASS", "0");
    panel.SoftKey(2).Click();
    panel.SoftKey(3).Click();
    EXPECT_EQ(panel.State, CF::MEAS);
    EXPECT_EQ(panel.SoftKey(0).Caption.get(), "MEASURE");
    expectPlayed();
}

struct PictureRow {
    Menu menu;
    Button CF::*shown;
    const char* picture;
};

class HardKeyPicture : public PanelSession, public ::testing::TestWithParam<PictureRow> {};

TEST_P(HardKeyPicture, CurrentKey_IsBlueAndTheOthersAreYellow) {
    open(GetParam().menu);
    EXPECT_EQ((panel.*GetParam().shown).Picture.get(), GetParam().picture);
    int yellow = 0;
    for (Button* key : {&panel.FrequencyButton, &panel.BWButton, &panel.SweepButton,
                        &panel.TraceButton, &panel.MeasButton, &panel.TrackButton1,
                        &panel.SpanButton, &panel.AmplitudeButton, &panel.MarkerButton}) {
        const std::string picture = key->Picture.get();
        if (picture.size() > 2 && picture.substr(picture.size() - 2) == "_y") ++yellow;
    }
    EXPECT_EQ(yellow, 8);
}

INSTANTIATE_TEST_SUITE_P(Keys, HardKeyPicture,
                         ::testing::Values(PictureRow{kFreq, &CF::FrequencyButton, "freq_b"},
                                           PictureRow{kSpan, &CF::SpanButton, "span_b"},
                                           PictureRow{kAmpt, &CF::AmplitudeButton, "ampl_b"},
                                           PictureRow{kBW, &CF::BWButton, "band_b"},
                                           PictureRow{kSweep, &CF::SweepButton, "sweep_b"},
                                           PictureRow{kTrace, &CF::TraceButton, "trace_b"},
                                           PictureRow{kMeas, &CF::MeasButton, "meas_b"}));

TEST_F(LayoutTest, ModeMenu_KeepsThePicturesOfTheHardKeys) {
    open(kSpan);
    open(kChnPower);
    EXPECT_EQ(panel.SpanButton.Picture.get(), "span_b");
}

struct FillRow {
    const char* name;
    Menu menu;
    std::vector<const char*> words;
};

class MenuFillQueries : public PanelSession, public ::testing::TestWithParam<FillRow> {};

TEST_P(MenuFillQueries, FirstVisit_AsksItsWordsAndTheSecondNothing) {
    panel.InstrumentMode = GetParam().menu.mode;
    for (const char* word : GetParam().words) get(word, "1");
    (panel.*GetParam().menu.key).Click();
    expectPlayed();
    const std::string written = port.written();
    (panel.*GetParam().menu.key).Click();
    EXPECT_EQ(port.written(), written);
    EXPECT_EQ(boxes.texts(), Texts{});
}

INSTANTIATE_TEST_SUITE_P(
    Menus, MenuFillQueries,
    ::testing::Values(FillRow{"Freq", kFreq, {"FREQOFFS"}}, FillRow{"Span", kSpan, {}},
                      FillRow{"Amplitude", kAmpt, {"REFLVLOFFS", "RFINPUT"}},
                      FillRow{"Bandwidth", kBW, {"RBW", "VBW"}},
                      FillRow{"Trace", kTrace, {"TRACEMODE"}},
                      FillRow{"Measurement", kMeas, {"MEAS"}}, FillRow{"Tracking", kTracking, {}},
                      FillRow{"Power", kPower, {}},
                      FillRow{
                          "ChannelPower", kChnPower, {"CHPWRSTD", "CHPWR", "CHPWRUNIT", "CHPWRBW"}},
                      FillRow{"OccupiedBandwidth", kOccBW, {"OBWSTD", "OBW", "OBWCHBW"}},
                      FillRow{"Tdma", kTdma, {"TDMASTD", "MEASTIME", "TDMAPWR"}},
                      FillRow{"DistanceToFault", kDtf, {"DTFMODE"}}),
    [](const auto& tested) { return std::string(tested.param.name); });

TEST_F(LayoutTest, SweepKey_AsksForItsTimeAtEachVisit) {
    get("SWPTIME", "0.5");
    get("SWPCONT", "1");
    get("TRIGSRC", "1");
    get("SWPTIME", "0.25");
    panel.SweepButton.Click();
    EXPECT_EQ(panel.SoftTextBox(0).Text.get(), "500 ms");
    EXPECT_EQ(panel.ChoiceBox(2).Text(), "Continuous");
    EXPECT_EQ(panel.ChoiceBox(3).Text(), "Video");
    EXPECT_EQ(panel.SoftKey(4).Caption.get(), "TRIGGER\r\nLEVEL");
    panel.SweepButton.Click();
    EXPECT_EQ(panel.SoftTextBox(0).Text.get(), "250 ms");
    expectPlayed();
}

TEST_F(LayoutTest, SweepFill_KnowsTheExternalTriggers) {
    for (const int source : {0, 1, 2, 3}) {
        mirror.MenuVisitCount.fill(0);
        get("SWPTIME", "0.5");
        get("SWPCONT", "0");
        get("TRIGSRC", std::to_string(source));
        panel.SweepButton.Click();
        EXPECT_EQ(mirror.ExternalTriggerActive, source >= 2);
    }
    expectPlayed();
}

TEST_F(LayoutTest, FrequencyFill_InTheTrackingMode_DoesNotAskForTheOffset) {
    panel.InstrumentMode = CF::TRACKINGGENERATOR;
    panel.FrequencyButton.Click();
    EXPECT_EQ(port.written(), "");
}

TEST_F(LayoutTest, FrequencyFill_ShowsTheMirror) {
    mirror.CenterFrequency = 1.5e9;
    mirror.Span = 2e8;
    mirror.FrequencyOffset = 100;
    open(kFreq);
    const char* texts[] = {"1.5 GHz", "200 MHz", "1.4 GHz", "1.6 GHz", "100 Hz"};
    for (int i = 0; i < 5; ++i) EXPECT_EQ(panel.SoftTextBox(i).Text.get(), texts[i]);
}

TEST_F(LayoutTest, DistanceToFaultFill_InDtfMode_AsksForTheLength) {
    panel.InstrumentMode = CF::DISTTOFAULTMEASURE;
    get("DTFMODE", "0");
    get("CABLELEN", "12.5");
    panel.DistFaultButton.Click();
    expectPlayed();
    EXPECT_EQ(panel.SoftTextBox(1).Text.get(), "12.5 m");
    EXPECT_EQ(panel.ChoiceBox(2).Text(), "DTF");
}

TEST_F(LayoutTest, Visits_AreNotForgottenByADisconnection) {
    get("TRACEMODE", "2");
    panel.TraceButton.Click();
    panel.isConnected = false;
    panel.TraceButton.Click();
    panel.isConnected = true;
    panel.TraceButton.Click();
    expectPlayed();
    EXPECT_EQ(panel.ChoiceBox(0).Text(), "Max Hold");
}

TEST_F(LayoutTest, NotConnected_HardKeysLayOutTheirMenuAndSendNothing) {
    panel.isConnected = false;
    panel.AmplitudeButton.Click();
    EXPECT_EQ(panel.State, CF::AMPT);
    EXPECT_EQ(port.written(), "");
    EXPECT_EQ(boxes.texts(), Texts{});
}

TEST_F(LayoutTest, ChoiceBoxes_OfAnotherMenu_AreHiddenEmptiedAndUnlocked) {
    SoftPanel soft(panel);
    for (int i = 0; i < 5; ++i) {
        panel.ChoiceBox(i).setItems({"one", "two"});
        panel.ChoiceBox(i).Visible = true;
        panel.ChoiceBox(i).Locked = true;
        panel.SoftTextBox(i).Visible = false;
    }
    soft.SetTextFieldsAndFrames(0);  // of no menu: no position is laid out
    for (int i = 0; i < 5; ++i) {
        EXPECT_FALSE(panel.ChoiceBox(i).Visible) << i;
        EXPECT_FALSE(panel.ChoiceBox(i).Locked) << i;
        EXPECT_EQ(panel.ChoiceBox(i).ListCount(), 0) << i;
        EXPECT_TRUE(panel.SoftTextBox(i).Visible) << i;
    }
}

TEST_F(LayoutTest, SetButtonColor_UnknownWord_LeavesTheKey) {
    SoftPanel soft(panel);
    soft.SetButtonColor(1, "green");
    soft.SetButtonColor(1, "blue");
    EXPECT_EQ(panel.SoftKey(1).BackColor.get(), kGreen);
    soft.SetButtonColor(1, "red");
    EXPECT_EQ(panel.SoftKey(1).BackColor.get(), kRed);
    soft.SetButtonColor(1, "gray");
    EXPECT_EQ(panel.SoftKey(1).BackColor.get(), kButtonFace);
}

}  // namespace
}  // namespace zel
