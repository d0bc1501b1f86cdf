// Lines that end too early: each is run at every length.

#include <gtest/gtest.h>

#include "tests/script/SimulatedRun.h"

namespace zel {
namespace {

struct CutLines : ::testing::TestWithParam<const char*> {};

TEST_P(CutLines, AtEveryCharacter_TheRunEndsAndTheLineWorksOn) {
    constexpr int kMostStatements = 40;
    const std::string whole = GetParam();
    SimulatedRun session;
    session.folder.write("VIEW1.CSV", "no view");
    int statements = 0;
    session.program.scripts().executor.StatementBegins.connect([&](int) {
        if (++statements > kMostStatements) session.form.cmdStop.Click();
    });
    for (std::size_t length = 0; length <= whole.size(); ++length) {
        const std::string cut = whole.substr(0, length);
        for (const char* before : {"", "SAVERESULTS R*.TXT\r\nDO\r\n"}) {
            statements = 0;
            session.run(before + cut + "\r\nLOOP 2\r\n");
            if (!session.form.ReachedEnd) session.form.cmdStop.Click();
            session.expectFree(cut);
        }
        statements = 0;
        session.form.chkStep.setValue(false);
        session.run("SAVERESULTS ALIVE.TXT\r\nGET FREQ\r\n");
        EXPECT_TRUE(session.form.ReachedEnd) << "after \"" << cut << '"';
        EXPECT_EQ(linesOf(session.folder.read("ALIVE.TXT")).size(), length + 1) << cut;
    }
}

INSTANTIATE_TEST_SUITE_P(
    EachStatement, CutLines,
    ::testing::Values("# A COMMENT", "NOSAVE", "SAVERESULTS OUT*.TXT", "STEPMODE", "CMD RECALL",
                      "SET FREQ,1,5E9", "GET LEVEL", "GET CTRACE", "GETSWEEP 1.5", "GET TRACE 2",
                      "QUICKSWEEP 1.5", "QUICK TRACE 2", "SAVESWEEP", "SHOWDIALOG A CRLF B",
                      "WATERFALL ON", "WATERFALL OFF", "AUTORECALL DATA", "COMMENT PASS I OF 2",
                      "PAUSE 1.5", "LOOP -1", "LOOP 40000", "SCANLVLUPPL -20.5", "AVGCOUNT 2",
                      "AVGCOUNT -32769", "SCANLVLLOWL -80.5", "SCANSTART 100000000",
                      "SCANSTEP 1000000", "SCANSTOP 200000000", "LOADTRACE VIEW*.CSV",
                      "SAVESCREEN PIC*.WMF"));

}  // namespace
}  // namespace zel
