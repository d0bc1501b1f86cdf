#include <gtest/gtest.h>

#include "link/CommandExchange.h"
#include "link/InstrumentErrors.h"
#include "tests/ShownBoxes.h"

namespace zel {
namespace {

struct InstrumentErrors : ::testing::Test {
    ZELBas state;
    RecordedBoxes boxes;
    InstrumentErrors() { state.RemoteAccepted = true; }

    Texts report(int status) {
        boxes.clear();
        ReportInstrumentError(state, boxes, status, "FREQ,1");
        return shownBoxes(boxes);
    }
    static Texts box(const std::string& text) { return {"information | ZEL3 Error | " + text}; }
};

constexpr const char* kManual = "Please refer to the ZEL3 Z9 Manual for further instructions.";

TEST_F(InstrumentErrors, Status1_IsASyntaxError) {
    EXPECT_EQ(report(1), box(std::string("Syntax error!  for command <FREQ,1>\r\n") + kManual));
}

TEST_F(InstrumentErrors, Status2_IsAnExecutionError) {
    EXPECT_EQ(report(2), box(std::string("Execution error  for command <FREQ,1>\r\n"
                                         "Command is not allowed in the current measurement "
                                         "mode\r\n") +
                             kManual));
}

TEST_F(InstrumentErrors, Status3_IsAFullStorage) {
    EXPECT_EQ(report(3),
              box(std::string("Dataset Storage Full  for command <FREQ,1>\r\n") + kManual));
}

TEST_F(InstrumentErrors, Status4_IsNotAllowed) {
    EXPECT_EQ(report(4), box(std::string("Not Allowed  for command <FREQ,1>\r\n"
                                         "In the current state of the instrument setting this "
                                         "parameter or value is not allowed.\r\n") +
                             kManual));
}

TEST_F(InstrumentErrors, Status5_IsOutOfRange) {
    EXPECT_EQ(report(5), box(std::string("Out of Range  for command <FREQ,1>\r\n"
                                         "The parameter value is out of range and cannot be "
                                         "programmed.\r\n") +
                             kManual));
}

TEST_F(InstrumentErrors, Status6_HasNoBox) { EXPECT_EQ(report(6), Texts{}); }

TEST_F(InstrumentErrors, Status7_IsTheBaudRateAndNamesNoCommand) {
    EXPECT_EQ(report(7), box("ERROR: The baud rate is incorrect.\r\n"
                             "The baud rates of the remote modem and the instrument have to "
                             "match."));
}

TEST_F(InstrumentErrors, StatusOutsideTheTable_HasNoBox) {
    for (const int status : {-32768, -1, 0, 8, 9, 32767}) EXPECT_EQ(report(status), Texts{});
}

TEST_F(InstrumentErrors, BeforeRemoteIsAccepted_NothingIsTold) {
    state.RemoteAccepted = false;
    for (int status = 1; status <= 7; ++status) EXPECT_EQ(report(status), Texts{}) << status;
}

TEST_F(InstrumentErrors, DuringAScan_NothingIsTold) {
    state.ScanInProgress = true;
    for (int status = 1; status <= 7; ++status) EXPECT_EQ(report(status), Texts{}) << status;
}

TEST(StatusNumber, Prefix_IsTheNumberAndJunkIs0) {
    EXPECT_EQ(statusNumber("0"), 0);
    EXPECT_EQ(statusNumber("7 junk"), 7);
    EXPECT_EQ(statusNumber(" 3"), 3);
    EXPECT_EQ(statusNumber("-1"), -1);
    EXPECT_EQ(statusNumber(""), 0);
    EXPECT_EQ(statusNumber("junk"), 0);
    EXPECT_EQ(statusNumber("1e300"), 0);
    EXPECT_EQ(statusNumber("32767"), 32767);
    EXPECT_EQ(statusNumber("32768"), 0);
    EXPECT_EQ(statusNumber("-32767"), -32767);
    EXPECT_EQ(statusNumber("-32768"), 0);
}

}  // namespace
}  // namespace zel
