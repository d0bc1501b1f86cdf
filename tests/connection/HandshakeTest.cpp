#include <gtest/gtest.h>

#include <algorithm>

#include "connection/Handshake.h"
#include "panel/MenuFill.h"
#include "panel/SoftPanel.h"
#include "tests/connection/Bench.h"
#include "tests/link/Line.h"
#include "trace/FrequencyLabels.h"

namespace zel {
namespace {

using CF = ControllerForm;

TEST_F(Connection, Handshake_WordsGoInTheirOrder) {
    page().whole();
    EXPECT_TRUE(connect());
    expectPlayed();
    EXPECT_EQ(port.written(),
              "\r"
              "cmd\rREMOTE\r"
              "GET\rIDN?\r"
              "GET\rTRACEDET\r"
              "GET\rMEAS\r"
              "GET\rFREQ\r"
              "GET\rSPAN\r"
              "GET\rUNIT\r"
              "GET\rREFLVL\r"
              "GET\rRANGE\r"
              "GET\rDYNRANGE\r"
              "GET\rSWPTIME\r"
              "GET\rSWPCONT\r"
              "cmd\rINIT\r"
              "GET\rRBW\r"
              "GET\rVBW\r"
              "GET\rFREQOFFS\r");
    EXPECT_EQ(shown(), Texts{});
}

TEST_F(Connection, Handshake_Answers_GoIntoTheMirror) {
    page({{"SPAN", "2000000"},
          {"UNIT", "2"},
          {"REFLVL", "-33.5"},
          {"RANGE", "3"},
          {"DYNRANGE", "2"},
          {"SWPTIME", "0.125"},
          {"FREQOFFS", "250"}})
        .whole();
    connect();
    EXPECT_EQ(mirror.InstrumentModel, 9102);
    EXPECT_EQ(mirror.InstrumentSerial, 12345);
    EXPECT_EQ(mirror.TraceDetector, 3);
    EXPECT_EQ(mirror.CenterFrequency, 1.5e9);
    EXPECT_EQ(mirror.Span, 2e6);
    EXPECT_EQ(mirror.ReferenceUnit, 2);
    EXPECT_EQ(mirror.ReferenceLevel, -33.5);
    EXPECT_EQ(mirror.ReferenceRange, 3);
    EXPECT_EQ(mirror.DynamicRangeMode, 2);
    EXPECT_EQ(mirror.SweepTime, 0.125);
    EXPECT_EQ(mirror.SweepContinuous, 1);
    EXPECT_EQ(mirror.ResolutionBandwidth, 4);
    EXPECT_EQ(mirror.VideoBandwidth, 5);
    EXPECT_EQ(mirror.FrequencyOffset, 250);
    EXPECT_FALSE(panel.SingleSweepModeActive);
}

TEST_F(Connection, Handshake_Labels_ShowCentreAndSpan) {
    page().whole();
    connect();
    EXPECT_EQ(panel.CFLabel.Caption.get(), "Center: 1.5 GHz");
    EXPECT_EQ(panel.SpanLabel.Caption.get(), "Span: 1 MHz");
}

TEST_F(Connection, Handshake_Identity_IsShownInTheDialog) {
    page().whole();
    connect();
    EXPECT_EQ(dialog.IDText.Text.get(), kIdentity);
    EXPECT_EQ(forms.tcpConnection.IDTextBox.Text.get(), "");
}

TEST_F(Connection, Handshake_LineOfSteps_TellsHowFarItGot) {
    page().whole();
    Texts lines;
    panel.DebugTextBox.Changed.connect([&] { lines.push_back(status()); });
    connect();
    ASSERT_GT(lines.size(), 4U);
    EXPECT_EQ(lines[0], "Sending initializing <CR> ...");
    EXPECT_EQ(lines[1], "Reading the first response...");
    EXPECT_EQ(lines[2], "Successful");
    EXPECT_EQ(lines[3], "CMD <REMOTE> starting");
    EXPECT_NE(std::find(lines.begin(), lines.end(), "Marlow & Tenb"), lines.end());
}

TEST_F(Connection, Handshake_HalfASecondLiesAheadOfTheFirstCr) {
    page().whole();
    EXPECT_EQ(time([this] { connect(); }), 500);
}

TEST_F(Connection, Handshake_ConnectedLook) {
    page().whole();
    connect();
    EXPECT_TRUE(panel.isConnected);
    EXPECT_FALSE(dialog.IsConnecting);
    EXPECT_FALSE(panel.SetDevice.Enabled);
    EXPECT_TRUE(panel.ConnectedPic.Visible);
    EXPECT_TRUE(panel.Picture3.Visible);
    EXPECT_EQ(panel.State, CF::Freq);
    EXPECT_FALSE(dialog.Visible);
    EXPECT_FALSE(dialog.CancelButton.Visible);
    EXPECT_FALSE(dialog.ZELButton.Visible);
    EXPECT_TRUE(dialog.DisconnectButton.Visible);
    EXPECT_TRUE(panel.Disconnect.Enabled);
    EXPECT_TRUE(panel.SaveCurrentView.Enabled);
    EXPECT_TRUE(panel.RecordData.Enabled);
    for (const MenuItem* item : {&panel.Direct, &panel.Modem, &panel.GSM, &panel.GSMToModem,
                                 &panel.ModemToGSM, &panel.TCPConnection})
        EXPECT_FALSE(item->Enabled) << item->name();
    EXPECT_EQ(dialog.MousePointer.get(), 0);
    EXPECT_EQ(panel.SoftTextBox(0).Text.get(), "1.5 GHz");
    EXPECT_EQ(panel.SoftTextBox(1).Text.get(), "1 MHz");
}

TEST_F(Connection, Handshake_WhileItRuns_PointerAndFlagSayIt) {
    page().whole();
    int pointer = 0;
    bool connecting = false;
    later(250, [&] {
        pointer = dialog.MousePointer;
        connecting = dialog.IsConnecting;
    });
    connect();
    EXPECT_EQ(pointer, 11);
    EXPECT_TRUE(connecting);
}

TEST_F(Connection, Handshake_OldModeChecks_AreCleared) {
    panel.DistFaultCheck.setValue(true);
    page({{"MEAS", "1"}}).whole();
    connect();
    EXPECT_FALSE(panel.DistFaultCheck.Value());
    EXPECT_TRUE(panel.AnalyzerCheck.Value());
}

TEST_F(Connection, Handshake_FirstAnswer_CanBeAnythingThatIsNotEmpty) {
    port.expect("\r").answer("1\r");
    page().cmd("REMOTE").identity().detectorModeAndFrequency().state().get("FREQOFFS", "0");
    EXPECT_TRUE(connect());
    expectPlayed();
    EXPECT_EQ(shown(), Texts{});
}

TEST_F(Connection, Handshake_RemoteRefused_IsBroughtBackByTheModeWithoutABox) {
    page().wake().cmd("REMOTE", "2").set("MEAS,1").cmd("REMOTE").identity();
    page().detectorModeAndFrequency().state().get("FREQOFFS", "0");
    EXPECT_TRUE(connect());
    expectPlayed();
    EXPECT_EQ(shown(), Texts{});
    EXPECT_TRUE(line.RemoteAccepted);
}

TEST_F(Connection, Handshake_RemoteRefusedTwice_GoesOnWithoutBoxesOfTheInstrument) {
    page().wake().cmd("REMOTE", "2").set("MEAS,1", "2").cmd("REMOTE", "2").identity();
    page().detectorModeAndFrequency().state().get("FREQOFFS", "0");
    EXPECT_TRUE(connect());
    expectPlayed();
    EXPECT_EQ(shown(), Texts{});
    EXPECT_FALSE(line.RemoteAccepted);
}

TEST_F(Connection, Handshake_DetectorMinus2_ChangesTheModeAndAsksOnceMore) {
    page().wake().cmd("REMOTE").identity().get("TRACEDET", "-2").set("MEAS,1").get("TRACEDET", "4");
    page().get("MEAS", "1").get("FREQ", "1500000000").state().get("FREQOFFS", "0");
    EXPECT_TRUE(connect());
    expectPlayed();
    EXPECT_EQ(mirror.TraceDetector, 4);
}

TEST_F(Connection, Handshake_DetectorMinus2Twice_IsTakenAsTheNumber) {
    page().wake().cmd("REMOTE").identity();
    page().get("TRACEDET", "-2").set("MEAS,1").get("TRACEDET", "-2");
    page().get("MEAS", "1").get("FREQ", "1500000000").state().get("FREQOFFS", "0");
    EXPECT_TRUE(connect());
    expectPlayed();
    EXPECT_EQ(mirror.TraceDetector, static_cast<std::uint8_t>(-2));
}

TEST_F(Connection, Handshake_ModeAnswers_GiveModeAndCheckBox) {
    struct Row {
        const char* answer;
        std::int16_t mode;
        const char* check;
    };
    const Row rows[] = {
        {"7", CF::DISTTOFAULTMEASURE, "DistFaultCheck"},
        {"6", CF::TDMAPOWERMODE, "TDMAPowerCheck"},
        {"5", CF::OCCBANDWIDTH, "OccBWCheck"},
        {"4", CF::CHANNELPOWER, "ChannelPowerCheck"},
        {"2", CF::TRACKINGGENERATOR, "TrackingGenCheck"},
        {"1", CF::ANALYZER, "AnalyzerCheck"},
        {"8", CF::ANALYZER, "AnalyzerCheck"},
        {"0", CF::ANALYZER, "AnalyzerCheck"},
        {"-3", CF::ANALYZER, "AnalyzerCheck"},
        {"junk", CF::ANALYZER, "AnalyzerCheck"},
    };
    const char* const checks[] = {"AnalyzerCheck", "TrackingGenCheck",  "PowerSensorCheck",
                                  "OccBWCheck",    "ChannelPowerCheck", "TDMAPowerCheck",
                                  "DistFaultCheck"};
    for (const Row& row : rows) {
        Bench bench;
        Page whole = bench.page({{"MEAS", row.answer}});
        whole.wake().cmd("REMOTE").identity().detectorModeAndFrequency().state();
        // The tracking generator has no frequency offset to ask for.
        if (row.mode != CF::TRACKINGGENERATOR) whole.get("FREQOFFS", "0");
        EXPECT_TRUE(bench.connect()) << row.answer;
        bench.expectPlayed();
        EXPECT_EQ(bench.panel.InstrumentMode, row.mode) << row.answer;
        for (const char* name : checks) {
            const auto* check = dynamic_cast<OptionButton*>(bench.panel.control(name));
            ASSERT_NE(check, nullptr) << name;
            EXPECT_EQ(check->Value(), std::string(name) == row.check) << row.answer << name;
        }
    }
}

TEST_F(Connection, Handshake_PowerSensor_ReadsNeitherSpanNorLevelNorSweep) {
    page({{"MEAS", "3"}})
        .wake()
        .cmd("REMOTE")
        .identity()
        .detectorModeAndFrequency()
        .get("FREQOFFS", "0");
    EXPECT_TRUE(connect());
    expectPlayed();
    EXPECT_EQ(panel.InstrumentMode, CF::POWERSENSOR);
    EXPECT_TRUE(panel.PowerSensorCheck.Value());
    EXPECT_EQ(port.written().find("INIT"), std::string::npos);
}

TEST_F(Connection, Handshake_ModeQueryRefused_GoesOnInTheModeAsItWas) {
    panel.InstrumentMode = CF::CHANNELPOWER;
    page().wake().cmd("REMOTE").identity().get("TRACEDET", "3").line("GET", "MEAS", "1");
    page().get("FREQ", "1500000000").state().get("FREQOFFS", "0");
    EXPECT_TRUE(connect());
    expectPlayed();
    EXPECT_EQ(panel.InstrumentMode, CF::CHANNELPOWER);
}

TEST_F(Connection, Handshake_SingleSweep_SendsNoInit) {
    page({{"SWPCONT", "0"}}).whole();
    EXPECT_TRUE(connect());
    expectPlayed();
    EXPECT_TRUE(panel.SingleSweepModeActive);
    EXPECT_EQ(port.written().find("INIT"), std::string::npos);
}

TEST_F(Connection, Handshake_Done_LeavesNoSettingUnsure) {
    for (const char* word : {"FREQ", "SPAN", "REFLVL", "RANGE", "TRACEDET"})
        mirror.Unsure.sent(word, false);
    page({{"MEAS", "3"}}).wake().cmd("REMOTE").identity().detectorModeAndFrequency();
    page().get("FREQOFFS", "0");
    EXPECT_TRUE(connect());
    expectPlayed();
    EXPECT_FALSE(mirror.Unsure.any());
    EXPECT_FALSE(panel.SpanLabel.Struck);
}

TEST_F(Connection, Handshake_LevelThatIsNoNumber_IsAskedForOnceMore) {
    page().wake().cmd("REMOTE").identity().detectorModeAndFrequency();
    page().get("SPAN", "1000000").get("UNIT", "0").get("REFLVL", "").get("REFLVL", "-20");
    page().get("RANGE", "1").get("DYNRANGE", "1").get("SWPTIME", "0.02").get("SWPCONT", "1");
    page().cmd("INIT").get("RBW", "4").get("VBW", "5").get("FREQOFFS", "0");
    EXPECT_TRUE(connect());
    expectPlayed();
    EXPECT_EQ(mirror.ReferenceLevel, -20);
    EXPECT_FALSE(mirror.Unsure.any());
}

// What the handshake did not learn the first cycle asks for.
TEST_F(Connection, Handshake_FrequencyThatIsNoNumber_IsUnsure) {
    page().wake().cmd("REMOTE").identity();
    page().get("TRACEDET", "").get("MEAS", "1").get("FREQ", "").state().get("FREQOFFS", "0");
    EXPECT_TRUE(connect());
    expectPlayed();
    EXPECT_TRUE(mirror.Unsure.has(AxisSetting::Frequency));
    EXPECT_TRUE(mirror.Unsure.has(AxisSetting::Detector));
    EXPECT_TRUE(panel.CFLabel.Struck);
}

TEST_F(Connection, Handshake_SecondOfTheProcess_AsksNoFrequencyOffset) {
    page().whole().cmd("LOCAL");
    page().wake().cmd("REMOTE").identity().detectorModeAndFrequency().state();
    EXPECT_TRUE(connect());
    program.disconnect();
    EXPECT_TRUE(connect());
    expectPlayed();
}

TEST_F(Connection, Handshake_LongIdentity_ShowsItsFirst13Characters) {
    page({{"IDN?", "   Marlow   Tenby,9103,7"}}).whole();
    Texts lines;
    panel.DebugTextBox.Changed.connect([&] { lines.push_back(status()); });
    EXPECT_TRUE(connect());
    EXPECT_NE(std::find(lines.begin(), lines.end(), "   Marlow   T"), lines.end());
    EXPECT_EQ(mirror.InstrumentModel, 9103);
}

TEST_F(Connection, Handshake_IdentityWithFieldsThatAreNoNumbers_IsAccepted) {
    page({{"IDN?", "Marlow,ZEL,99999999999999999999"}}).whole();
    EXPECT_TRUE(connect());
    EXPECT_EQ(mirror.InstrumentModel, 0);
    EXPECT_EQ(mirror.InstrumentSerial, 1e20);
}

/// The handshake on its own, on a link that some other kind of dialog has brought up.
struct BareHandshake : LineSetup {
    BareHandshake() { whileConnecting(); }
    ZEL3Variables mirror;
    FrequencyLabels labels{panel, dialog, mirror, exchange, events};
    SoftPanel softPanel{panel};
    MenuFill fill{panel, mirror, exchange};
    InstrumentLink line{state, link, reader, exchange, binary};
    Handshake handshake{forms, mirror, line, labels, {softPanel, fill}, session};
};

TEST(DialledHandshake, MobilePhones_SettleForThreeSecondsMore) {
    for (const std::int16_t kind : kSerialKinds) {
        BareHandshake bare;
        bare.panel.ConnectionState = kind;
        Page(bare.port).whole();
        bare.handshake.InitConnection();
        EXPECT_TRUE(bare.panel.isConnected) << kind;
        bare.expectPlayed();
        const bool modems = kind == CF::DIRECTCON || kind == CF::MODEMCON;
        EXPECT_EQ(bare.debug.momentOf("-> \r"), modems ? 500 : 3500) << kind;
    }
}

TEST(DialledHandshake, MobilePhones_LineShowsThePause) {
    BareHandshake bare;
    bare.panel.ConnectionState = CF::GSMCON;
    Page(bare.port).whole();
    Texts lines;
    bare.panel.DebugTextBox.Changed.connect([&] { lines.push_back(bare.status()); });
    bare.handshake.InitConnection();
    ASSERT_FALSE(lines.empty());
    EXPECT_EQ(lines[0], "...");
}

TEST(DialledHandshake, Silence_LeavesTheDialButtonAndNoBoxWhenCancelled) {
    BareHandshake bare;
    bare.panel.ConnectionState = CF::MODEMCON;
    bare.state.DialCancelled = true;
    bare.dialog.DialButton.Visible = false;
    bare.dialog.CancelButton.Visible = true;
    bare.port.expect("\r").silence();
    bare.handshake.InitConnection();
    EXPECT_EQ(bare.shown(), Texts{});
    EXPECT_TRUE(bare.dialog.DialButton.Visible);
    EXPECT_FALSE(bare.dialog.CancelButton.Visible);
    EXPECT_FALSE(bare.panel.isConnected);
}

TEST_F(Connection, ButtonWord_HidesTheQuickConnectWhileConnected) {
    Bench bench("button");
    EXPECT_TRUE(bench.panel.ImmConnect.Visible);
    bench.page().whole();
    bench.connect();
    EXPECT_FALSE(bench.panel.ImmConnect.Visible);
    EXPECT_TRUE(bench.panel.STAT);
}

}  // namespace
}  // namespace zel
