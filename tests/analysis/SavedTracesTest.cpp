#include <gtest/gtest.h>

#include <stdexcept>

#include "analysis/SavedTraces.h"

namespace zel {
namespace {

std::vector<SpectrumTrace> all(const std::string& text, DateOrder order = DateOrder::YearMonthDay) {
    std::vector<SpectrumTrace> traces;
    readTraces(text, order, [&traces](const SpectrumTrace& trace) {
        traces.push_back(trace);
        return true;
    });
    return traces;
}

std::string complaint(const std::string& text) {
    try {
        all(text);
    } catch (const std::runtime_error& problem) {
        return problem.what();
    }
    return "no complaint";
}

const std::string kHeader =
    "Trace Name;Analyzer\r\nDate;2026-11-21\r\nTime;14:05:09\r\nSpan;2000\r\n"
    "Sweeptime;0.6\r\nResolution Bandwidth;300\r\nReference Unit;dBuV\r\n"
    "Trace Write Pointer;301\r\n\r\n";

std::string rows(int count, const std::string& value) {
    std::string text;
    for (int i = 0; i < count; ++i) text += std::to_string(i) + ".000;" + value + "; \r\n";
    return text;
}

TEST(ReadTraces, View_HasItsSettingsAndRows) {
    const std::vector<SpectrumTrace> traces =
        all(kHeader + "1000.000;-20.5; \r\n1001.000;-30; \r\n");
    ASSERT_EQ(traces.size(), 1u);
    EXPECT_EQ(traces[0].x, (std::vector<double>{1000, 1001}));
    EXPECT_EQ(traces[0].level, (std::vector<double>{-20.5, -30}));
    EXPECT_EQ(traces[0].xUnit, "Hz");
    EXPECT_EQ(traces[0].unit, "dBuV");
    EXPECT_EQ(traces[0].rbw, 300);
    EXPECT_EQ(traces[0].time, "2026-11-21T14:05:09");
}

TEST(ReadTraces, Recording_HasATraceAHeader) {
    std::string other = kHeader;
    other.replace(other.find("14:05:09"), 8, "14:05:19");
    const std::vector<SpectrumTrace> traces =
        all(kHeader + rows(301, "-20") + other + rows(301, "-30"));
    ASSERT_EQ(traces.size(), 2u);
    EXPECT_EQ(traces[0].level.size(), 301u);
    EXPECT_EQ(traces[1].level.front(), -30);
    EXPECT_EQ(traces[1].time, "2026-11-21T14:05:19");
}

TEST(ReadTraces, HeaderLineLeftOut_DoesNotComeFromTheTraceBefore) {
    const std::vector<SpectrumTrace> traces =
        all(kHeader + rows(3, "-20") + "Trace Name;Analyzer\r\n\r\n" + rows(3, "-30"));
    ASSERT_EQ(traces.size(), 2u);
    EXPECT_EQ(traces[1].rbw, 0);
    EXPECT_EQ(traces[1].unit, "dBm");
    EXPECT_EQ(traces[1].time, "");
}

TEST(ReadTraces, RowsAlone_AreCutEvery301) {
    const std::vector<SpectrumTrace> traces = all(rows(301, "-1") + rows(301, "-2"));
    ASSERT_EQ(traces.size(), 2u);
    EXPECT_EQ(traces[1].level.front(), -2);
}

TEST(ReadTraces, Pairs_CountWithTheHighestLevelOfTheirPoint) {
    // The second value of a row belongs to the point before; the first row's to none.
    const std::vector<SpectrumTrace> traces =
        all(kHeader + "1.000;-80;-20\r\n2.000;-75;-30\r\n3.000;-10;-70\r\n");
    ASSERT_EQ(traces.size(), 1u);
    EXPECT_EQ(traces[0].level, (std::vector<double>{-30, -70, -10}));
    EXPECT_EQ(traces[0].x, (std::vector<double>{1, 2, 3}));
}

TEST(ReadTraces, ZeroSpan_RunsOverTheSweepTime) {
    std::string text = kHeader;
    text.replace(text.find("Span;2000"), 9, "Span;ZERO SPAN");
    const std::vector<SpectrumTrace> traces = all(text + ".000;-1; \r\n.000;-2; \r\n.000;-3; \r\n");
    ASSERT_EQ(traces.size(), 1u);
    EXPECT_EQ(traces[0].xUnit, "s");
    EXPECT_DOUBLE_EQ(traces[0].x[2], 2 * 0.6 / 300);
}

TEST(ReadTraces, LinearUnits_BecomeDbm) {
    std::string volts = kHeader;
    volts.replace(volts.find("dBuV"), 4, "V");
    const std::vector<SpectrumTrace> traces = all(volts + "1.000;0.22360679774997896; \r\n");
    ASSERT_EQ(traces.size(), 1u);
    EXPECT_EQ(traces[0].unit, "dBm");
    EXPECT_NEAR(traces[0].level[0], 0, 1e-9);
    EXPECT_EQ(complaint(volts + "1.000;-1; \r\n"), "a level of 0 V or below has no value in dBm");
    EXPECT_EQ(complaint(volts + "1.000;0; \r\n"), "a level of 0 V or below has no value in dBm");
}

TEST(ReadTraces, RowCutShort_IsLeftOut) {
    const std::vector<SpectrumTrace> traces = all(kHeader + "1.000;-20; \r\n2.0");
    ASSERT_EQ(traces.size(), 1u);
    EXPECT_EQ(traces[0].level.size(), 1u);
}

TEST(ReadTraces, DecimalComma_IsRead) {
    const std::vector<SpectrumTrace> traces = all("1,500;-20,25; \n");
    ASSERT_EQ(traces.size(), 1u);
    EXPECT_EQ(traces[0].x[0], 1.5);
    EXPECT_EQ(traces[0].level[0], -20.25);
}

TEST(ReadTraces, WhatIsNoView_IsRefused) {
    EXPECT_EQ(complaint(""), "no trace was found in the file");
    EXPECT_EQ(complaint("some words\nand more\n"), "no trace was found in the file");
    EXPECT_EQ(complaint("Data at;x\n1;2\n ........END OF LOG FOR x\n"),
              "this is a log of the older format, not a saved view");
}

TEST(ReadTraces, SinkHasEnough_EndsTheReading) {
    int taken = 0;
    readTraces(rows(903, "-1"), DateOrder::YearMonthDay, [&taken](const SpectrumTrace&) {
        ++taken;
        return taken < 2;
    });
    EXPECT_EQ(taken, 2);
}

TEST(IsoTime, PlaceOfTheYear_Decides) {
    EXPECT_EQ(isoTime("2026-02-03", "01:02:03", DateOrder::DayMonthYear), "2026-02-03T01:02:03");
    EXPECT_EQ(isoTime("03.02.2026", "01:02:03", DateOrder::YearMonthDay), "2026-02-03T01:02:03");
    EXPECT_EQ(isoTime("3/2/2026", "1:02:03", DateOrder::DayMonthYear), "2026-02-03T01:02:03");
    EXPECT_EQ(isoTime("3/2/2026", "1:02:03", DateOrder::MonthDayYear), "2026-03-02T01:02:03");
}

TEST(IsoTime, MonthPastTwelve_WasTheDay) {
    EXPECT_EQ(isoTime("2/13/2026", "01:02:03", DateOrder::DayMonthYear), "2026-02-13T01:02:03");
    EXPECT_EQ(isoTime("13/2/2026", "01:02:03", DateOrder::MonthDayYear), "2026-02-13T01:02:03");
}

TEST(IsoTime, WhatMakesNoSense_IsUnknown) {
    EXPECT_EQ(isoTime("", "01:02:03", DateOrder::YearMonthDay), "");
    EXPECT_EQ(isoTime("2026-02-03", "", DateOrder::YearMonthDay), "");
    EXPECT_EQ(isoTime("2026-02-30", "01:02:03", DateOrder::YearMonthDay), "");
    EXPECT_EQ(isoTime("2026-02-03", "24:00:00", DateOrder::YearMonthDay), "");
    EXPECT_EQ(isoTime("03/02/26", "01:02:03", DateOrder::DayMonthYear), "");
}

TEST(DateOrderOf, SampleText_TellsTheOrder) {
    EXPECT_EQ(dateOrderOf("2001-02-03"), DateOrder::YearMonthDay);
    EXPECT_EQ(dateOrderOf("03.02.2001"), DateOrder::DayMonthYear);
    EXPECT_EQ(dateOrderOf("2/3/2001"), DateOrder::MonthDayYear);
}

}  // namespace
}  // namespace zel
