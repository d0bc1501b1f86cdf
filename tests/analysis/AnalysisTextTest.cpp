#include <gtest/gtest.h>

#include <algorithm>
#include <stdexcept>

#include "analysis/AnalysisText.h"
#include "support/NumberText.h"
#include "tests/analysis/Traces.h"

namespace zel {
namespace {

AnalysisRequest everything() {
    AnalysisRequest request;
    request.peaks = 2;
    request.bandwidth = 3;
    request.channels = {{0, 2}, {8, 9}};
    request.occupied = 99;
    request.mask = readMask("x;upper;lower\n0;-5;\n4;-5;\n");
    return request;
}

TEST(AnalysisJson, MissingFigures_AreNull) {
    const AnalysisRequest request = everything();
    AnalysisResult result = analyseTrace(levels({-10, -12, -12.5}), request);
    result.file = "a \"b\"\\\n.csv";
    result.trace = 1;
    const std::string json = analysisJson(result, request);
    EXPECT_EQ(json.substr(0, json.find(", \"occupied\"")),
              "{\"file\": \"a \\\"b\\\"\\\\\\u000a.csv\", \"trace\": 1, \"time\": null, "
              "\"x_unit\": \"Hz\", \"unit\": \"dBm\", \"peaks\": [{\"x\": 0, \"level\": -10}], "
              "\"bandwidth\": {\"x\": 0, \"level\": -10, \"low\": null, \"high\": null, "
              "\"width\": null}, \"channels\": [{\"start\": 0, \"stop\": 2, \"power\": " +
                  shortestNumber(channelPower(levels({-10, -12, -12.5}), 0, 2).value()) +
                  "}, {\"start\": 8, \"stop\": 9, \"power\": null}]");
    EXPECT_EQ(json.substr(json.find(", \"mask\"")),
              ", \"mask\": {\"pass\": true, \"margin\": 5, \"x\": 0}}");
}

TEST(AnalysisJson, OnlyWhatWasAskedFor_IsWritten) {
    AnalysisResult result = analyseTrace(levels({-10}), {});
    result.time = "2026-11-21T14:05:09";
    EXPECT_EQ(analysisJson(result, {}),
              "{\"file\": null, \"trace\": 0, \"time\": \"2026-11-21T14:05:09\", \"x_unit\": "
              "\"Hz\", \"unit\": \"dBm\"}");
}

TEST(AnalysisJson, Occupancy_IsAListOfShares) {
    AnalysisRequest request;
    request.occupancy = -50;
    AnalysisRun run(request);
    EXPECT_FALSE(run.add(levels({-40, -60}), "a.csv", 1));
    EXPECT_FALSE(run.add(levels({-60, -60}), "a.csv", 2));
    EXPECT_EQ(analysisJson(run.finish().value(), request),
              "{\"file\": null, \"trace\": 0, \"time\": null, \"x_unit\": \"Hz\", \"unit\": "
              "\"dBm\", \"occupancy\": [0.5, 0]}");
}

TEST(AnalysisCsv, HeaderAndRows_AreOfEqualLength) {
    const AnalysisRequest request = everything();
    const auto fields = [](const std::string& line) {
        return std::count(line.begin(), line.end(), ',');
    };
    const std::string header = analysisCsvHeader(request, 0);
    const std::string found =
        analysisCsvRow(analyseTrace(levels({-50, -10, -50}), request), request);
    const std::string nothing = analysisCsvRow(analyseTrace(levels({}), request), request);
    EXPECT_EQ(fields(header), fields(found));
    EXPECT_EQ(fields(header), fields(nothing));
    EXPECT_EQ(header.substr(0, 62),
              "file,trace,time,x_unit,unit,peak1_x,peak1_level,peak2_x,peak2_");
}

TEST(AnalysisCsv, FileNameWithACommaOrQuote_IsQuoted) {
    AnalysisResult result;
    result.file = "a,\"b\".csv";
    EXPECT_EQ(analysisCsvRow(result, {}), "\"a,\"\"b\"\".csv\",0,,,");
}

TEST(AnalysisText, Lines_TellEachFigure) {
    AnalysisRequest request;
    request.peaks = 1;
    request.channels = {{5, 6}};
    request.mask = readMask("x;upper;lower\n0;-20;\n4;-20;\n");
    AnalysisResult result = analyseTrace(levels({-50, -10, -50}), request);
    result.file = "a.csv";
    result.trace = 3;
    EXPECT_EQ(analysisText(result, request),
              (std::vector<std::string>{"a.csv, trace 3", "  peak 1: 1 Hz, -10 dBm",
                                        "  channel 5 to 6 Hz: unknown",
                                        "  mask: FAIL, margin -10 dB at 1 Hz"}));
}

TEST(AnalysisRun, Hold_GivesOneResultForAll) {
    AnalysisRequest request;
    request.peaks = 1;
    request.hold = HoldKind::Max;
    AnalysisRun run(request);
    EXPECT_FALSE(run.add(levels({-50, -10, -50}), "a.csv", 1));
    EXPECT_FALSE(run.add(levels({-50, -5, -50}), "b.csv", 1));
    const AnalysisResult result = run.finish().value();
    EXPECT_EQ(result.trace, 0u);
    EXPECT_EQ(result.file, "");
    ASSERT_EQ(result.peaks.size(), 1u);
    EXPECT_EQ(result.peaks[0].level, -5);
}

TEST(AnalysisRun, TraceOfAnotherSpan_IsRefusedInWords) {
    AnalysisRequest request;
    request.hold = HoldKind::Max;
    AnalysisRun run(request);
    run.add(levels({-50, -10}), "a.csv", 1);
    try {
        run.add(levels({-50}), "b.csv", 2);
        FAIL();
    } catch (const std::runtime_error& problem) {
        EXPECT_STREQ(problem.what(), "trace 2 has another span or unit than those before");
    }
}

TEST(AnalysisRun, Mask_RemembersAFailure) {
    AnalysisRequest request;
    request.mask = readMask("x;upper;lower\n0;-20;\n4;-20;\n");
    AnalysisRun run(request);
    run.add(levels({-50, -50}), "", 1);
    EXPECT_FALSE(run.maskFailed());
    run.add(levels({-50, -10}), "", 2);
    run.add(levels({-50, -50}), "", 3);
    EXPECT_TRUE(run.maskFailed());
    EXPECT_FALSE(run.maskCoveredNothing());
}

TEST(AnalysisRun, MaskThatCoversNothing_IsKnown) {
    AnalysisRequest request;
    request.mask = readMask("x;upper;lower\n10;-20;\n20;-20;\n");
    AnalysisRun run(request);
    run.add(levels({0, 0}), "", 1);
    EXPECT_FALSE(run.maskFailed());
    EXPECT_TRUE(run.maskCoveredNothing());
}

}  // namespace
}  // namespace zel
