#include <algorithm>

#include "shell/Logs.h"
#include "tests/server/ServerBench.h"

namespace zel {
namespace {

struct ServerLog : ServerBench, ::testing::Test {
    RootDebug& log = program.logs().rootDebug;

    /// The entries so far, each as "LEVEL SOURCE: DESCRIPTION".
    Texts entries() {
        Texts all;
        FileProblem problem;
        const auto bytes = readAll();
        std::size_t at = 0;
        std::string level;
        std::string source;
        while (at < bytes.size()) {
            const auto end = std::min(bytes.find('\n', at), bytes.size());
            std::string entry = bytes.substr(at, end - at);
            at = end + 1;
            if (!entry.empty() && entry.back() == '\r') entry.pop_back();
            const auto after = [&entry](const char* name) {
                const auto found = entry.find(name);
                return found == std::string::npos ? std::string()
                                                  : entry.substr(entry.find(": ", found) + 2);
            };
            if (entry.size() > 7 && entry.substr(7, 3) != "   ") level = entry.substr(7);
            if (const std::string text = after("SOURCE"); !text.empty()) source = text;
            if (const std::string text = after("DESCRIPTION"); !text.empty())
                all.push_back(level + " " + source + ": " + text);
        }
        return all;
    }
    std::string readAll() {
        FileProblem problem;
        const auto reader = platform.files.open(log.FileName, problem);
        if (!reader) return {};
        std::string bytes(reader->size(), ' ');
        bytes.resize(reader->read(bytes, problem));
        return bytes;
    }
};

TEST_F(ServerLog, Events_AreWrittenByTheirLevel) {
    EXPECT_FALSE(log.FileLogEnabled);
    bridge();
    EXPECT_TRUE(log.FileLogEnabled);
    EXPECT_TRUE(log.FileTimeStamping);
    enter();
    enter("8.8.8.8");
    form.cmdDisconnectClient.Click();
    form.cmdCancel.Click();
    EXPECT_EQ(entries(),
              (Texts{"Info StartListening: listening 192.168.1.7:2277",
                     "Info connect: instrument COM3 57600", "Info knocked: client 127.0.0.1",
                     "Error refused: refused 8.8.8.8: Not on the list.",
                     "Info clientGone: client gone", "Info disconnect: closed"}));
}

TEST_F(ServerLog, FailedPorts_AreErrors) {
    load();
    line.failOpen("COM3 is held by another program.", 1);
    form.cmdConnect.Click();
    server.failListen("The address is in use.");
    form.cmdConnect.Click();
    const Texts all = entries();
    ASSERT_EQ(all.size(), 5U) << ::testing::PrintToString(all);
    EXPECT_EQ(all[1],
              "Error report: Could not connect to the specified COM port! COM3 is held by another "
              "program.");
    EXPECT_EQ(all[3], "Error StartListening: The TCP port cannot be used! The address is in use.");
}

TEST_F(ServerLog, StrangerWhoKnocksWithoutEnd_FillsNoLog) {
    bridge();
    const std::size_t before = entries().size();
    for (int i = 0; i < 50; ++i) enter("8.8.8.8");
    EXPECT_EQ(entries().size(), before + 1);
    EXPECT_EQ(std::count(happened.begin(), happened.end(), "refused 8.8.8.8"), 50);
    enter("9.9.9.9");
    run(61'000);
    enter("9.9.9.9");
    EXPECT_EQ(entries().size(), before + 3);
}

TEST_F(ServerLog, BytesOfTheClient_AreNotWritten) {
    bridge();
    enter();
    line.expect("secret\r").answer("0\r");
    client.arrive("secret\r");
    run(100);
    EXPECT_EQ(readAll().find("secret"), std::string::npos);
}

TEST_F(ServerLog, EachCall_LeavesTheStackAsItWas) {
    log.LogPushPop = true;
    bridge();
    enter();
    client.arrive("GET\r");
    run(100);
    form.cmdCancel.Click();
    EXPECT_EQ(log.CallStackTop, -1);
    const std::string staircase = readAll();
    for (const char* routine : {"cmdConnect_Click", "StartListening", "ConnectInstrument",
                                "knocked", "RelayToInstrument", "cmdCancel_Click"})
        EXPECT_NE(staircase.find(routine), std::string::npos) << routine;
}

TEST_F(ServerLog, NewcomerWithSomethingToProve_PutsNobodyOutBeforeThat) {
    bridge();
    enter("127.0.0.1");
    server.wantProof();
    enter("10.0.0.2");
    EXPECT_EQ(form.txtClientIP.Text.get(), "127.0.0.1");
    server.failsProof(2, "The TLS handshake took too long.");
    EXPECT_EQ(form.txtClientIP.Text.get(), "127.0.0.1");
    EXPECT_EQ(entries().back(),
              "Error refused: refused 10.0.0.2: The TLS handshake took too long.");
    enter("10.0.0.3");
    server.givesProof(3);
    EXPECT_EQ(form.txtClientIP.Text.get(), "10.0.0.3");
}

}  // namespace
}  // namespace zel
