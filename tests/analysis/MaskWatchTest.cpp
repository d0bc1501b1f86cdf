// What happens when a sweep fails the mask.

#include <gtest/gtest.h>

#include "analysis/MaskWatch.h"
#include "analysis/SavedTraces.h"
#include "platform/virtual/VirtualPlatform.h"

namespace zel {
namespace {

using Words = std::vector<std::string>;

struct RecordedCommands : CommandRunner {
    std::string start(const Words& words) override {
        if (!refuse.empty()) return refuse;
        started.push_back(words);
        atWork = true;
        return {};
    }
    bool running() override { return atWork; }
    bool waitForEnd(int) override { return !atWork; }
    std::optional<int> ended() override {
        if (atWork) return std::nullopt;
        const std::optional<int> last = status;
        status.reset();
        return last;
    }
    void end(int with) {
        atWork = false;
        status = with;
    }
    std::vector<Words> started;
    std::string refuse;
    bool atWork = false;
    std::optional<int> status;
};

struct Watching : testing::Test {
    Watching() {
        watch.Problem = [this](const std::string& text) { problems.push_back(text); };
    }
    static Sweep sweepOf(std::vector<double> levels) {
        Sweep sweep;
        sweep.wanted = sweep.came = levels.size();
        sweep.axis.start = 100;
        sweep.axis.stop = 100 + static_cast<double>(levels.size()) - 1;
        sweep.axis.intervals = static_cast<double>(levels.size()) - 1;
        sweep.axis.unit = "Hz";
        sweep.physical = std::move(levels);
        sweep.settings.TraceDetector = DETSAMPLE;
        sweep.settings.Span = 2;
        sweep.time = 36925.5;
        sweep.instrumentMode = 2;
        return sweep;
    }
    void pass() { watch.take(sweepOf({-90, -80, -90}), {true, 10, 101}); }
    void fail() { watch.take(sweepOf({-90, -20, -90}), {false, -2.5, 101}); }
    std::vector<SpectrumTrace> savedTraces() {
        std::vector<SpectrumTrace> traces;
        readTraces(platform.files.bytes("/failed.csv"), DateOrder::YearMonthDay,
                   [&traces](const SpectrumTrace& trace) {
                       traces.push_back(trace);
                       return true;
                   });
        return traces;
    }

    VirtualPlatform platform;
    RecordedCommands commands;
    MaskWatch watch{platform.files, commands, platform.clock};
    std::vector<std::string> problems;
};

TEST_F(Watching, FailingSweep_IsSavedByItself) {
    watch.set({"/failed.csv", 0, {}});
    pass();
    EXPECT_EQ(platform.files.bytes("/failed.csv"), "");
    fail();
    pass();
    fail();
    const std::vector<SpectrumTrace> traces = savedTraces();
    ASSERT_EQ(traces.size(), 2U);
    EXPECT_EQ(traces[0].level, (std::vector<double>{-90, -20, -90}));
    EXPECT_EQ(traces[0].x, (std::vector<double>{100, 101, 102}));
    EXPECT_EQ(watch.text(), "2 sweeps saved");
}

TEST_F(Watching, Recording_BeginsWithTheFailingSweepAndEnds) {
    watch.set({"/failed.csv", 2, {}});
    pass();
    fail();
    for (int i = 0; i < 5; ++i) pass();
    ASSERT_EQ(savedTraces().size(), 3U);
    EXPECT_EQ(savedTraces()[1].level[1], -80);
}

TEST_F(Watching, SweepThatDidNotComeWhole_IsLeftOut) {
    watch.set({"/failed.csv", 1, {"note"}});
    fail();
    Sweep cut = sweepOf({-90, -20, -90});
    cut.came = 1;
    watch.take(cut, {});
    EXPECT_EQ(watch.saved(), 1U);
}

TEST_F(Watching, CommandThatIsTakenAway_StillSaysHowItEnded) {
    watch.set({"", 0, {"note"}});
    fail();
    watch.set({});
    commands.end(3);
    watch.follow();
    EXPECT_EQ(watch.problem(), "The command note ended with status 3");
}

TEST_F(Watching, Command_GetsItsWordsFilledAndRunsAlone) {
    watch.set({"/failed.csv", 0, {"note", "at {x} by {margin}", "{time}", "{file}", "{y}"}});
    fail();
    fail();
    ASSERT_EQ(commands.started.size(), 1U);
    EXPECT_EQ(commands.started[0],
              (Words{"note", "at 101 by -2.5", "2001-02-03T12:00:00", "/failed.csv", "{y}"}));
    commands.end(0);
    fail();
    EXPECT_EQ(commands.started.size(), 2U);
    EXPECT_EQ(watch.text(), "3 sweeps saved, 2 commands started, 1 passed over while one ran");
    EXPECT_TRUE(problems.empty());
}

TEST_F(Watching, CommandThatFails_IsReportedOnceAndTheWatchingGoesOn) {
    watch.set({"", 0, {"note"}});
    commands.refuse = "The command note cannot be started: No such file or directory";
    fail();
    fail();
    EXPECT_EQ(problems, Words{commands.refuse});
    EXPECT_EQ(watch.problem(), commands.refuse);
    commands.refuse.clear();
    fail();
    commands.end(3);
    watch.follow();
    EXPECT_EQ(problems.back(), "The command note ended with status 3");
    fail();
    commands.end(0);
    watch.follow();
    EXPECT_EQ(watch.problem(), "");
}

TEST_F(Watching, FileThatCannotBeWritten_IsReportedAndTheCommandStillRuns) {
    watch.set({"/no/such/folder/failed.csv", 0, {"note"}});
    fail();
    ASSERT_EQ(problems.size(), 1U);
    EXPECT_NE(problems[0].find("/no/such/folder/failed.csv"), std::string::npos) << problems[0];
    EXPECT_EQ(commands.started.size(), 1U);
    EXPECT_EQ(watch.saved(), 0U);
}

TEST(CommandWords, QuotesKeepWordsTogetherAndNothingElseIsRead) {
    EXPECT_EQ(commandWords("  mail  -s \"mask failed\" me "),
              (Words{"mail", "-s", "mask failed", "me"}));
    EXPECT_EQ(commandWords("a \"\" \"say \"\"hi\"\"\" $HOME;`x`|y"),
              (Words{"a", "", "say \"hi\"", "$HOME;`x`|y"}));
    EXPECT_EQ(commandWords(" "), Words{});
    EXPECT_EQ(commandWords("mail \"open"), std::nullopt);
}

}  // namespace
}  // namespace zel
