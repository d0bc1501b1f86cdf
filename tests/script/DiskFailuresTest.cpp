// Each statement that writes, on a disk that is full, read-only or gone.

#include <gtest/gtest.h>

#include "files/OutputFile.h"
#include "tests/script/SimulatedRun.h"

namespace zel {
namespace {

enum class Failure { Full, ReadOnly, Vanished };
enum class Outcome { Silent, Box, BoxAndEnd };

struct Writing {
    const char* statement;  ///< may stand for several lines
    Outcome outcome;
};

/// Results are dropped without a word; what the panel saves is shown; a picture ends the run.
constexpr Writing kWritings[] = {
    {"GET FREQ", Outcome::Silent},
    {"COMMENT SOMETHING", Outcome::Silent},
    {"AVGCOUNT 1\r\nGET CTRACE", Outcome::Silent},
    {"SCANLVLUPPL -300\r\nSCANSTART 1E8\r\nSCANSTEP 1E6\r\nSCANSTOP 1E8", Outcome::Silent},
    {"GETSWEEP\r\nSAVESWEEP", Outcome::Box},
    {"SAVESCREEN KEPT\\PIC.WMF", Outcome::BoxAndEnd},
};

struct DiskFailures : ::testing::TestWithParam<std::tuple<Writing, Failure>> {
    void fail(Failure failure, SimulatedRun& session) const {
        VirtualFiles& files = session.platform.files;
        const std::string kept = session.folder.file("KEPT");
        if (failure == Failure::Full) files.room = 3;
        if (failure == Failure::Vanished) files.vanish(kept);
        if (failure != Failure::ReadOnly) return;
        for (const char* name : {"", "/OUT.TXT", "/OTHER.TXT"})
            files.refuse(kept + name, "Read-only file system");
    }
    void mend(SimulatedRun& session) const {
        VirtualFiles& files = session.platform.files;
        const std::string kept = session.folder.file("KEPT");
        files.room = 1 << 30;
        files.comeBack(kept);
        for (const char* name : {"", "/OUT.TXT", "/OTHER.TXT"}) files.refuse(kept + name, "");
    }
};

TEST_P(DiskFailures, NothingWrittenIsLostAndTheRunGoesOn) {
    const auto [writing, failure] = GetParam();
    SimulatedRun session;
    session.folder.write("KEPT/OUT.TXT", "before\r\n");
    session.program.forms().controller.DrawImage.connect(
        [&](const std::string& path, std::string& problem) {
            const FileProblem drawn = session.platform.files.replace(path, "picture");
            if (!drawn.empty()) problem = writeProblem(path, drawn);
        });
    session.program.scripts().executor.StatementBegins.connect(
        [&, broken = false, failure = failure](int index) mutable {
            if (index == 0 || broken) return;
            broken = true;
            fail(failure, session);
        });
    session.platform.boxes.clear();
    session.run("SAVERESULTS KEPT\\OUT.TXT\r\n" + std::string(writing.statement) +
                "\r\nCOMMENT AFTER\r\n");
    session.expectFree(writing.statement);
    EXPECT_EQ(session.form.ReachedEnd, writing.outcome != Outcome::BoxAndEnd);
    const std::size_t boxes = session.platform.boxes.boxes().size();
    EXPECT_EQ(boxes, writing.outcome == Outcome::Silent ? 0U : 1U);
    mend(session);
    EXPECT_EQ(session.folder.read("KEPT/OUT.TXT"), "before\r\n");
    EXPECT_FALSE(session.folder.has("KEPT/PIC.WMF"));
    // The next run writes as if nothing had been.
    if (!session.form.ReachedEnd) session.form.cmdStop.Click();
    session.run("SAVERESULTS KEPT\\OUT.TXT\r\nCOMMENT AGAIN\r\n");
    EXPECT_TRUE(session.form.ReachedEnd);
    EXPECT_EQ(linesOf(session.folder.read("KEPT/OUT.TXT")).size(), 2U);
}

INSTANTIATE_TEST_SUITE_P(EachWriting, DiskFailures,
                         ::testing::Combine(::testing::ValuesIn(kWritings),
                                            ::testing::Values(Failure::Full, Failure::ReadOnly,
                                                              Failure::Vanished)));

}  // namespace
}  // namespace zel
