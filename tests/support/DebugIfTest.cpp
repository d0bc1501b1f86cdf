#include "support/DebugIf.h"
#include "tests/support/LogFixture.h"

namespace zel {
namespace {

struct DebugIfTest : LogFixture {
    DebugIfTest() {
        log.DebugFileName = kFile;
        log.STAT = true;
    }
    static constexpr const char* kFile = "/home/debug.log";
    DebugIf log{clock, files};
};

TEST_F(DebugIfTest, SwitchedOff_WritesNothing) {
    log.STAT = false;
    log.OutputDebug("-> GET");
    EXPECT_FALSE(files.has(kFile));
}

TEST_F(DebugIfTest, Line_IsTheTextAlone) {
    log.OutputDebug("-> GET");
    log.OutputDebug("");
    EXPECT_EQ(linesOf(kFile), (Lines{"-> GET", ""}));
}

TEST_F(DebugIfTest, TimeAndHeader_StandBeforeTheText) {
    log.TimeSamping = true;
    log.OutputDebug("<- 0");
    log.DebugHeader = "Line ";
    log.OutputDebug("<- 0");
    log.TimeSamping = false;
    log.OutputDebug("<- 0");
    log.DebugHeader = "  ";  // nothing but blanks is no header
    log.OutputDebug("<- 0");
    EXPECT_EQ(linesOf(kFile),
              (Lines{"00,043,200.000:<- 0", "00,043,200.000:Line  <- 0", "Line  <- 0", "<- 0"}));
}

TEST_F(DebugIfTest, KillOld_DeletesTheFileAndLoggingGoesOn) {
    log.OutputDebug("old");
    log.KillOld();
    EXPECT_FALSE(files.has(kFile));
    log.KillOld();  // nothing there: nothing happens
    log.OutputDebug("new");
    EXPECT_EQ(linesOf(kFile), Lines{"new"});
}

TEST_F(DebugIfTest, KillOld_LeavesWhatIsNoFile) {
    files.putFolder("/home/folder");
    log.DebugFileName = "/home/folder";
    log.KillOld();
    log.OutputDebug("lost");
    EXPECT_TRUE(files.has("/home/folder"));
}

TEST_F(DebugIfTest, LogThatCannotBeWritten_DisturbsNothing) {
    files.refuse("/home", "Permission denied");
    log.OutputDebug("lost");
    files.refuse("/home", "");
    log.OutputDebug("kept");
    EXPECT_EQ(linesOf(kFile), Lines{"kept"});
}

TEST_F(DebugIfTest, FullFile_IsPutAsideAndThreeOldOnesStay) {
    const auto fill = [&](char mark) {
        files.put(kFile, std::string(DebugIf::kLargestFile - 10, mark));
        log.OutputDebug("123456789");  // eleven bytes with the end of the line
    };
    for (const char mark : {'a', 'b', 'c', 'd'}) fill(mark);
    EXPECT_EQ(linesOf(kFile), Lines{"123456789"});
    const auto first = [&](const char* name) { return files.bytes(name).substr(0, 1); };
    EXPECT_EQ(first("/home/debug.1.log"), "d");
    EXPECT_EQ(first("/home/debug.2.log"), "c");
    EXPECT_EQ(first("/home/debug.3.log"), "b");
    EXPECT_FALSE(files.has("/home/debug.4.log"));
}

TEST_F(DebugIfTest, LineThatJustFits_StaysInTheFile) {
    files.put(kFile, std::string(DebugIf::kLargestFile - 11, 'a'));
    log.OutputDebug("123456789");
    EXPECT_EQ(files.stat(kFile).size, DebugIf::kLargestFile);
    EXPECT_FALSE(files.has("/home/debug.1.log"));
}

}  // namespace
}  // namespace zel
