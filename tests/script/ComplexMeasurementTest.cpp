#include <cmath>

#include "script/Statistics.h"
#include "tests/script/ScriptBench.h"

namespace zel {
namespace {

struct ComplexMeasurementTest : ScriptBench, testing::Test {
    /// One trace on the line: levels in thousandths of a dB, phases in millionths of a radian.
    void transfer(std::int32_t level, std::int32_t phase, bool wait) {
        cmd("INIT");
        if (wait) cmd("WAIT");
        port.expect("GET\r").answer("0\r");
        port.expect("CTRACEBIN\r").answer("0\r" + levelBlock(level) + levelBlock(phase));
    }
    STDForm& std = forms.std;
};

TEST(Statistics, FlatTrace_HasItsLevelAndNoDeviation) {
    std::vector<double> data(602, -30000);
    std::fill(data.begin() + 301, data.end(), 500000);
    scaleComplexTrace(data);
    const TraceStatistics trace = statisticsOf(data);
    EXPECT_NEAR(trace.meanLevel, -30, 1e-12);
    EXPECT_NEAR(trace.stdLevel, 0, 1e-9);
    EXPECT_NEAR(trace.meanPhase, 0.5, 1e-12);
    EXPECT_NEAR(trace.stdPhase, 0, 1e-9);
}

TEST(Statistics, Deviation_DividesBy299AroundTheGivenMean) {
    std::vector<double> samples(301, 1);
    EXPECT_DOUBLE_EQ(standardDeviation(samples, 0), std::sqrt(301.0 / 299.0));
    EXPECT_DOUBLE_EQ(standardDeviation(samples, 1), 0);
}

TEST(Statistics, MeanLevel_IsTheMeanOfThePowers) {
    std::vector<double> data(602, 0);
    for (std::size_t i = 0; i < 150; ++i) data[i] = 10;
    const double power = (150 * 10.0 + 151) / 301;
    EXPECT_NEAR(statisticsOf(data).meanLevel, 10 * std::log10(power), 1e-12);
}

TEST_F(ComplexMeasurementTest, FirstMeasurement_IsTheReferenceOfTheOthers) {
    transfer(-30000, 500000, true);
    transfer(-32000, 700000, false);
    transfer(-31000, 600000, true);
    transfer(-31000, 600000, false);
    run({"SAVERESULTS R*.TXT", "AVGCOUNT 2", "GET CTRACE", "GET CTRACE"});
    expectPlayed();
    EXPECT_TRUE(std.Visible);
    EXPECT_NEAR(std.refMeasLevel, -31, 1e-9);
    EXPECT_NEAR(std.refPhase, 0.6, 1e-9);
    EXPECT_EQ(std.refMeasBox.Text(),
              "Level: \t\t-31.0 dBm\r\nStd Dev Lvl: \t\t.0 dB\r\nPhase: \t\t.6\r\n"
              "Phase Std Dev(rad): \t\t.00\r\n");
    EXPECT_EQ(std.rtfReceive.Text(),
              "[ 1] Level: \t\t.0 dB\r\nStd Dev Lvl: \t\t.0 dB\r\nPhase: \t\t.0\r\n"
              "Phase Std Dev: \t\t.0\r\n");
    EXPECT_EQ(std.lblAvgCount.Caption.get(), "");
    EXPECT_TRUE(std.cmdExecute.Enabled);
    EXPECT_EQ(results("R1.TXT").size(), 4U);
    EXPECT_EQ(results("R2.TXT")[0], " < 2:meanlvl_____>; -31 ");
    EXPECT_EQ(results("RTEMP_1.TXT").size(), 602U);
    const Texts values = results("RVALUES.TXT");
    ASSERT_EQ(values.size(), 24U);
    EXPECT_EQ(values[0], " <next meas:_____>; 1 ");
    EXPECT_EQ(values[1], " <meanlvl________>; -30 ");
    EXPECT_EQ(values[3], " <meanphase______>; 0.5 ");
    EXPECT_EQ(form.DataFileNameSpec, "R*.TXT");
}

TEST_F(ComplexMeasurementTest, CountOfZero_TakesOneTraceAndOverflows) {
    transfer(-30000, 500000, true);
    run({"NOSAVE", "GET CTRACE", "COMMENT X"});
    expectPlayed();
    EXPECT_EQ(boxTexts(), Texts{"Overflow"});
    EXPECT_FALSE(form.ReachedEnd);
    EXPECT_FALSE(mirror.ScriptInProgress);
}

TEST_F(ComplexMeasurementTest, NegativeCount_TakesNoTraceAndGivesZeros) {
    run({"SAVERESULTS R*.TXT", "AVGCOUNT -3", "GET CTRACE"});
    expectPlayed();
    EXPECT_TRUE(boxTexts().empty());
    EXPECT_EQ(results("R1.TXT"), (Texts{" < 1:meanlvl_____>; 0 ", " < 1:stdlvl______>; 0 ",
                                        " < 1:meanphase(r)>; 0 ", " < 1:stdphase(r)_>; 0 "}));
}

TEST_F(ComplexMeasurementTest, Stop_EndsTheMeasurementBetweenTwoTraces) {
    transfer(-30000, 500000, true);
    std.lblAvgCount.Changed.connect([this] {
        if (std.lblAvgCount.Caption.get() == "2") form.cmdStop.Click();
    });
    run({"NOSAVE", "AVGCOUNT 3", "GET CTRACE"});
    EXPECT_FALSE(form.ReachedEnd);
    EXPECT_TRUE(std.cmdExecute.Enabled);
    EXPECT_EQ(std.refMeasBox.Text(), "");
}

TEST_F(ComplexMeasurementTest, Units_AreConvertedWithTheRoundPi) {
    std.lblMeanPhase.Caption = "3.14159265";
    std.lblStdPhase.Caption = "1.0";
    std.refPhase = 3.14159265;
    std.optRadians.Click();  // is selected
    EXPECT_EQ(std.refPhase, 3.14159265);
    std.optDegrees.Click();
    EXPECT_EQ(std.lblMeanPhase.Caption.get(), "180.0");
    EXPECT_EQ(std.lblStdPhase.Caption.get(), "57.3");
    EXPECT_DOUBLE_EQ(std.refPhase, 180);
    std.optRadians.Click();
    EXPECT_EQ(std.lblMeanPhase.Caption.get(), "3.142");
    EXPECT_DOUBLE_EQ(std.refPhase, 3.14159265);
}

TEST_F(ComplexMeasurementTest, Degrees_AreShownAndTheDeviationTaken) {
    std.optDegrees.Click();
    transfer(-30000, 3141592, true);
    run({"SAVERESULTS R.TXT", "AVGCOUNT 1", "GET CTRACE"});
    EXPECT_EQ(std.lblMeanPhase.Caption.get(), "180.0");
    EXPECT_EQ(std.lblStdPhase.Caption.get(), ".0");
    EXPECT_NEAR(std.refPhase, 180, 1e-3);
}

TEST_F(ComplexMeasurementTest, TenthRowAndOn_KeepTheColumns) {
    form.ctraceMeasurementNo = 10;
    program.scripts().display.displayPhaseMeasurement(0, 0, 0, 0);
    EXPECT_EQ(std.rtfReceive.Text().substr(0, 6), "[ 9] L");
    std.cmdClear.Click();
    EXPECT_EQ(std.rtfReceive.Text(), "");
    form.ctraceMeasurementNo = 11;
    program.scripts().display.displayPhaseMeasurement(0, 0, 0, 0);
    EXPECT_EQ(std.rtfReceive.Text().substr(0, 6), "[10] L");
}

TEST_F(ComplexMeasurementTest, Window_IsClearedByARunAndItsKeysFollow) {
    std.Show();
    std.rtfReceive.append({"old", false, false, 0});
    std.refMeasBox.append({"old", false, false, 0});
    std.cmdStop.Enabled = false;
    bool stopInRun = false;
    atStatement(0, [&] {
        stopInRun = std.cmdStop.Enabled;
        EXPECT_EQ(std.rtfReceive.Text() + std.refMeasBox.Text(), "");
    });
    run({"# X"});
    EXPECT_TRUE(stopInRun);
    EXPECT_FALSE(std.cmdStop.Enabled);
    atStatement(0, [&] {
        std.cmdExecute.Enabled = false;
        std.cmdStop.Click();
    });
    run({"# X", "# Y"});
    EXPECT_FALSE(form.ReachedEnd);
    EXPECT_FALSE(std.cmdStop.Enabled);
    EXPECT_TRUE(std.cmdExecute.Enabled);
    // The frame's cross empties both boxes.
    std.rtfReceive.append({"old", false, false, 0});
    std.refMeasBox.append({"old", false, false, 0});
    std.Unload(0);
    EXPECT_EQ(std.rtfReceive.Text() + std.refMeasBox.Text(), "");
}

TEST_F(ComplexMeasurementTest, WindowsExecute_RunsTheScript) {
    load({"SAVERESULTS R.TXT", "COMMENT X"});
    std.cmdExecute.Click();
    EXPECT_EQ(results("R.TXT"), Texts{" <comment________>; X"});
    EXPECT_TRUE(std.cmdExecute.Enabled);
}

}  // namespace
}  // namespace zel
