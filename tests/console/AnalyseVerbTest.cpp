// The verb analyse and the analysis of live sweeps, over the simulator in virtual time.

#include <gtest/gtest.h>

#include "console/AnalysisVerb.h"
#include "support/ExitStatus.h"
#include "tests/console/ToolRun.h"

namespace zel {
namespace {

struct AnalyseVerbTest : ToolRun {
    /// A table of 5 rows with one peak, in two traces.
    std::string recording() {
        const std::string header = "Trace Name;Analyzer\r\nSpan;4\r\nReference Unit;dBm\r\n\r\n";
        folder.write("two.csv", header +
                                    "1.000;-90; \r\n2.000;-40; \r\n3.000;-20; \r\n4.000;-40; \r\n" +
                                    "5.000;-90; \r\n" + header + "1.000;-90; \r\n2.000;-90; \r\n" +
                                    "3.000;-60; \r\n4.000;-90; \r\n5.000;-90; \r\n");
        return folder.file("two.csv");
    }
};

TEST_F(AnalyseVerbTest, EveryTraceOfAFile_GetsAnObject) {
    const std::string file = recording();
    ASSERT_EQ(run({"analyse", file, "--peaks", "1", "--json"}), kDone);
    EXPECT_EQ(printed(),
              (Texts{R"({"file": ")" + file +
                         R"(", "trace": 1, "time": null, "x_unit": "Hz", "unit": "dBm", )"
                         R"("peaks": [{"x": 3, "level": -20}]})",
                     R"({"file": ")" + file +
                         R"(", "trace": 2, "time": null, "x_unit": "Hz", "unit": "dBm", )"
                         R"("peaks": [{"x": 3, "level": -60}]})"}));
    EXPECT_EQ(errors.str(), "");
}

TEST_F(AnalyseVerbTest, HoldOverTwoFiles_IsOneObject) {
    const std::string file = recording();
    ASSERT_EQ(run({"analyse", file, file, "--hold", "average", "--peaks", "1", "--json"}), kDone);
    EXPECT_EQ(printed(), Texts{R"({"file": null, "trace": 0, "time": null, "x_unit": "Hz", )"
                               R"("unit": "dBm", "peaks": [{"x": 3, "level": -40}]})"});
}

TEST_F(AnalyseVerbTest, Occupancy_CountsTraces) {
    ASSERT_EQ(run({"analyse", recording(), "--occupancy", "-60", "--json"}), kDone);
    EXPECT_EQ(printed(), Texts{R"({"file": null, "trace": 0, "time": null, "x_unit": "Hz", )"
                               R"("unit": "dBm", "occupancy": [0, 0.5, 1, 0.5, 0]})"});
}

TEST_F(AnalyseVerbTest, FailedMask_GivesStatus3) {
    folder.write("mask.csv", "x;upper;lower\n1;-30;\n5;-30;\n");
    EXPECT_EQ(run({"analyse", recording(), "--mask", folder.file("mask.csv"), "--csv"}),
              kMaskFailed);
    const Texts lines = printed();
    ASSERT_EQ(lines.size(), 3U);
    EXPECT_EQ(lines[0], "file,trace,time,x_unit,unit,mask_pass,mask_margin,mask_x");
    EXPECT_NE(lines[1].find(",false,-10,3"), std::string::npos);
    EXPECT_NE(lines[2].find(",true,30,3"), std::string::npos);
}

TEST_F(AnalyseVerbTest, LiveSweeps_GiveTheFiguresOfTheSavedView) {
    const std::string view = folder.file("view.csv");
    ASSERT_EQ(runConnected({"sweep", "--output", view, "--analyse",
                            "--peaks 3 --bandwidth 3 --occupied 99 --channel 1e9,2e9 --csv"}),
              kDone);
    const Texts live = printed();
    ASSERT_EQ(live.size(), 2U);
    ASSERT_EQ(run({"analyse", view, "--peaks", "3", "--bandwidth", "3", "--occupied", "99",
                   "--channel", "1e9,2e9", "--csv"}),
              kDone);
    const Texts saved = printed();
    ASSERT_EQ(saved.size(), 2U);
    EXPECT_EQ(saved[0], live[0]);
    EXPECT_EQ(saved[1], view + live[1]);
}

TEST_F(AnalyseVerbTest, LiveSweepThatFailsItsMask_GivesStatus3) {
    folder.write("mask.csv", "x;upper;lower\n0;-150;\n3e9;-150;\n");
    EXPECT_EQ(runConnected({"sweep", "--count", "2", "--analyse",
                            "--json --mask " + folder.file("mask.csv")}),
              kMaskFailed);
    EXPECT_EQ(printed().size(), 2U);
}

TEST_F(AnalyseVerbTest, WrongOptions_AreRefusedBeforeAnythingIsSent) {
    const std::string file = recording();
    const std::vector<std::vector<std::string>> wrong = {
        {"--occupied", "101"}, {"--occupied", "-1"},       {"--channel", "5,1"},
        {"--channel", "5"},    {"--hold", "median"},       {"--peaks", "0"},
        {"--json", "--csv"},   {"--mask", "/no/such.csv"}, {"--occupancy", "-60", "--peaks", "1"}};
    for (const auto& options : wrong) {
        std::vector<std::string> words = {"analyse", file};
        std::string text;
        for (const std::string& word : options) {
            words.push_back(word);
            text += word + " ";
        }
        EXPECT_EQ(run(words), kWrongUse) << text;
        EXPECT_NE(errors.str(), "") << text;
        EXPECT_EQ(runConnected({"sweep", "--analyse", text}), kWrongUse) << text;
        EXPECT_EQ(out.str(), "") << text;
    }
    EXPECT_EQ(run({"analyse"}), kWrongUse);
}

TEST_F(AnalyseVerbTest, TracesThatDoNotFitTogether_GiveStatus1) {
    folder.write("other.csv", "Span;4\r\nReference Unit;dBm\r\n\r\n7.000;-90; \r\n8.000;-40; \r\n");
    EXPECT_EQ(run({"analyse", recording(), folder.file("other.csv"), "--hold", "max", "--json"}),
              kLinkFailed);
    EXPECT_NE(errors.str().find("another span or unit"), std::string::npos);
}

TEST_F(AnalyseVerbTest, FileThatIsMissing_GivesStatus1AndTheOthersAreDone) {
    EXPECT_EQ(run({"analyse", folder.file("gone.csv"), recording(), "--peaks", "1", "--json"}),
              kLinkFailed);
    EXPECT_EQ(printed().size(), 2U);
    EXPECT_NE(errors.str().find("No such file or directory"), std::string::npos);
}

TEST_F(AnalyseVerbTest, MaskThatCoversNothing_PassesWithAWord) {
    folder.write("mask.csv", "x;upper;lower\n100;-30;\n500;-30;\n");
    EXPECT_EQ(run({"analyse", recording(), "--mask", folder.file("mask.csv"), "--json"}), kDone);
    EXPECT_NE(out.str().find(R"("mask": {"pass": true, "margin": null, "x": null})"),
              std::string::npos);
    EXPECT_NE(errors.str().find("covers no sample"), std::string::npos);
}

TEST_F(AnalyseVerbTest, FailingSweeps_AreSavedAndStartTheCommand) {
    folder.write("mask.csv", "x;upper;lower\n0;-150;\n3e9;-150;\n");
    const std::string saved = folder.file("failed.csv");
    const std::string mark = folder.file("mark of it");
    ASSERT_EQ(runConnected({"sweep", "--count", "3", "--analyse",
                            "--mask " + folder.file("mask.csv") + " --save-failed " + saved +
                                " --run-failed 'touch \"" + mark + "\"'"}),
              kMaskFailed);
    EXPECT_EQ(errors.str(), "");
    EXPECT_EQ(linesOf(folder.read("mark of it")), Texts{});
    ASSERT_EQ(run({"analyse", saved, "--peaks", "1", "--json"}), kDone);
    EXPECT_EQ(printed().size(), 3U);
}

TEST_F(AnalyseVerbTest, PassingSweeps_AreNotSaved) {
    folder.write("mask.csv", "x;upper;lower\n0;50;\n3e9;50;\n");
    ASSERT_EQ(runConnected({"sweep", "--analyse",
                            "--mask " + folder.file("mask.csv") + " --save-failed " +
                                folder.file("failed.csv") + " --run-failed false"}),
              kDone);
    EXPECT_EQ(run({"analyse", folder.file("failed.csv")}), kLinkFailed) << "there is no such file";
}

TEST_F(AnalyseVerbTest, SaveOrCommandThatFails_IsReportedAndTheSweepsGoOn) {
    folder.write("mask.csv", "x;upper;lower\n0;-150;\n3e9;-150;\n");
    EXPECT_EQ(
        runConnected({"sweep", "--count", "3", "--analyse",
                      "--mask " + folder.file("mask.csv") + " --save-failed " +
                          folder.file("no/folder/x.csv") + " --run-failed no-such-command-here"}),
        kLinkFailed);
    EXPECT_EQ(printed().size(), 6U) << out.str();
    EXPECT_NE(errors.str().find("no/folder/x.csv"), std::string::npos) << errors.str();
    EXPECT_NE(errors.str().find("zelctl: The command no-such-command-here cannot be started"),
              std::string::npos)
        << errors.str();
}

TEST_F(AnalyseVerbTest, WatchOptionsThatDoNotGoTogether_AreWrongUse) {
    for (const char* options :
         {"--save-failed a.csv", "--mask m.csv --save-after 2", "--mask m.csv --run-failed \"\"",
          "--mask m.csv --hold max --save-failed a.csv"})
        EXPECT_EQ(runConnected({"sweep", "--analyse", options}), kWrongUse) << options;
}

}  // namespace
}  // namespace zel
