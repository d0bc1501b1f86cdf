#include "tests/server/ServerBench.h"

namespace zel {
namespace {

TEST_F(Server, Relay_CarriesBytesUnchanged) {
    bridge();
    enter();
    std::string all;
    for (int i = 0; i < 256; ++i) all += static_cast<char>(i);
    client.arrive(all);
    EXPECT_EQ(line.written(), all);
    line.arrive(all);
    run(11);
    EXPECT_EQ(sentToClient(), all);
}

TEST_F(Server, Group_GoesOnWhenTheLineWasQuietFor10Ms) {
    bridge();
    enter();
    line.arrive("0\r");
    run(9);
    line.arrive("12\r");
    run(9);
    EXPECT_EQ(sentToClient(), "");
    run(2);
    EXPECT_EQ(sentToClient(), "0\r12\r");
}

TEST_F(Server, Group_GoesOn100MsBehindItsFirstByteAtTheLatest) {
    bridge();
    enter();
    for (int i = 0; i < 20; ++i) {
        line.arrive("x");
        run(5);
        if (i == 18) {
            EXPECT_EQ(sentToClient(), "");
        }
    }
    EXPECT_EQ(sentToClient(), std::string(20, 'x'));
}

TEST_F(Server, GroupOf100Ms_AlwaysTakesTheWholeTime) {
    bridge();
    program.server().relay().setQuiet(100);
    enter();
    line.arrive("x");
    run(50);
    line.arrive("y");
    run(49);
    EXPECT_EQ(sentToClient(), "");
    run(2);
    EXPECT_EQ(sentToClient(), "xy");
}

TEST_F(Server, BinaryTrace_GoesOnAsItComes) {
    bridge();
    enter();
    client.arrive("GET\r");
    EXPECT_FALSE(form.doBinaryData);
    client.arrive("tracebin\r");
    EXPECT_TRUE(form.doBinaryData);
    line.arrive("0\r");
    EXPECT_EQ(sentToClient(), "0\r");
    client.arrive("GET\r");
    EXPECT_FALSE(form.doBinaryData);
}

TEST_F(Server, TraceWord_SplitAtEachByte_IsSeen) {
    bridge();
    enter();
    for (const char c : std::string("CTRACEBIN\r")) client.arrive(std::string(1, c));
    EXPECT_TRUE(form.doBinaryData);
    client.arrive("I");
    EXPECT_FALSE(form.doBinaryData);
}

TEST_F(Server, Newcomer_TakesThePlaceOfTheClient) {
    bridge();
    enter("10.0.0.1");
    line.setBacklog(1);
    client.arrive("GET\r");
    line.arrive("late");
    enter("10.0.0.2");
    line.setBacklog(0);
    run(200);
    EXPECT_EQ(form.txtClientIP.Text.get(), "10.0.0.2");
    EXPECT_EQ(line.written(), "");
    EXPECT_EQ(sentToClient(), "");
    EXPECT_EQ(happened, (Texts{"listening 192.168.1.7:2277", "instrument COM3 57600",
                               "client 10.0.0.1", "client gone", "client 10.0.0.2"}));
}

TEST_F(Server, Keep_RefusesNewcomers) {
    bridge();
    form.chkKeep.setValue(true);
    enter("10.0.0.1");
    enter("10.0.0.2");
    EXPECT_EQ(form.txtClientIP.Text.get(), "10.0.0.1");
    EXPECT_EQ(server.refused().size(), 1U);
    EXPECT_EQ(happened.back(), "refused 10.0.0.2");
}

TEST_F(Server, Keep_SetWhileAClientIsAtWork_IsStored) {
    bridge();
    enter("10.0.0.1");
    form.chkKeep.Click();
    EXPECT_EQ(platform.settings.get("ZELRemote", "ServerForm", "KeepClient", "absent"), "1");
    form.chkKeep.Click();
    EXPECT_EQ(platform.settings.get("ZELRemote", "ServerForm", "KeepClient", "absent"), "0");
}

TEST_F(Server, Stranger_IsRefusedAndTheClientStays) {
    bridge();
    enter("10.0.0.1");
    enter("8.8.8.8");
    EXPECT_EQ(happened.back(), "refused 8.8.8.8");
    client.arrive("GET\r");
    EXPECT_EQ(line.written(), "GET\r");
}

TEST_F(Server, AllowedNetworks_StandInPlaceOfTheUsualOnes) {
    load();
    form.txtAllowed.Text = "8.8.8.0/24";
    form.chkBaudRate.setValue(false);
    form.cmdConnect.Click();
    enter("127.0.0.1");
    EXPECT_EQ(happened.back(), "refused 127.0.0.1");
    enter("8.8.8.8");
    EXPECT_EQ(happened.back(), "client 8.8.8.8");
}

TEST_F(Server, ClientThatGoes_IsNoted) {
    bridge();
    enter();
    EXPECT_TRUE(form.txtClientIP.Visible);
    EXPECT_EQ(form.ClientState, 7);
    client.peerCloses();
    EXPECT_EQ(happened.back(), "client gone");
    EXPECT_FALSE(form.txtClientIP.Visible);
    EXPECT_FALSE(form.lblClient.Visible);
    EXPECT_EQ(form.ListenState, 2);
    enter("10.0.0.3");
    client.arrive("x");
    EXPECT_EQ(line.written(), "x");
}

TEST_F(Server, BytesWithoutAClient_AreDropped) {
    bridge();
    line.arrive("lost");
    run(200);
    enter();
    run(200);
    EXPECT_EQ(sentToClient(), "");
}

TEST_F(Server, ClientDuringTheSearch_IsHeldOff) {
    load();
    line.expect("\r\n").answer(kNoise).after(1000);
    for (int i = 0; i < 2; ++i) noise();
    identity();
    later(100, [this] { server.knock(1, "127.0.0.1"); });
    later(200, [this] { client.arrive("GET\r"); });
    form.cmdConnect.Click();
    EXPECT_EQ(line.failure(), "");
    run(100);
    EXPECT_EQ(line.leftOver(), "");
}

TEST_F(Server, SlowLine_StopsTheReadingOfTheClient) {
    bridge();
    enter();
    line.setBacklog(1);
    const std::string much(Relay::kMostForLine, 'a');
    client.arrive(much);
    client.arrive("later");
    EXPECT_EQ(client.peekData(), "later");
    EXPECT_EQ(program.server().relay().waiting(), much.size());
    line.setBacklog(0);
    run(20);
    EXPECT_EQ(line.written(), much + "later");
}

TEST_F(Server, SlowClient_IsClosed) {
    bridge();
    enter();
    client.setBacklog(Relay::kMostForClient);
    line.arrive("x");
    run(20);
    EXPECT_EQ(happened.back(), "client gone");
    EXPECT_EQ(client.state(), SocketState::Closed);
    EXPECT_TRUE(program.server().bridging());
}

TEST_F(Server, DisconnectClient_LeavesTheServerListening) {
    bridge();
    enter();
    EXPECT_TRUE(form.cmdDisconnectClient.Enabled);
    form.cmdDisconnectClient.Click();
    EXPECT_EQ(happened.back(), "client gone");
    EXPECT_EQ(server.state(), SocketState::Listening);
}

TEST_F(Server, InstrumentThatGoes_IsToldAndAllIsClosed) {
    bridge();
    enter();
    line.die();
    run(1500);
    EXPECT_FALSE(program.server().bridging());
    EXPECT_EQ(server.state(), SocketState::Closed);
    EXPECT_EQ(client.state(), SocketState::Closed);
    ASSERT_EQ(shown().size(), 1U);
    EXPECT_EQ(boxes.texts()[0].substr(0, 44), "Could not connect to the specified COM port!");
    EXPECT_EQ(happened.back(), "closed");
    EXPECT_TRUE(form.cmdConnect.Enabled);
    EXPECT_EQ(form.cmdCancel.Caption.get(), "cancel");
}

TEST_F(Server, InstrumentThatGoes_WithStartup_IsTriedAgainEvery10Seconds) {
    bridge();
    panel.UtilityStartup.Checked = true;
    line.die();
    line.failOpen("away", 2);
    run(25'000);
    EXPECT_FALSE(program.server().bridging());
    EXPECT_EQ(shown(), Texts{});
    EXPECT_EQ(form.txtDebug.Text.get(),
              "Tried again every 10 s. Could not connect to the specified COM port! away");
    run(10'000);
    EXPECT_TRUE(program.server().bridging());
    EXPECT_EQ(form.txtDebug.Text.get(), "");
}

TEST_F(Server, SocketInError_ListensAgainWithinASecond) {
    program.start();
    bridge();
    server.setState(SocketState::Error);
    run(1100);
    EXPECT_EQ(server.state(), SocketState::Listening);
    EXPECT_EQ(form.txtDebug.Text.get(), "Connection broken");
}

TEST_F(Server, Disconnect_KeepsTheCaptionAndClosingBringsItBack) {
    panel.Caption = "before";
    bridge();
    const std::string serving = panel.Caption.get();
    form.cmdCancel.Click();
    EXPECT_FALSE(line.isOpen());
    EXPECT_EQ(panel.Caption.get(), serving);
    EXPECT_EQ(form.cmdCancel.Caption.get(), "cancel");
    EXPECT_TRUE(form.cmdConnect.Enabled);
    boxes.answer(BoxAnswer::No);
    form.cmdCancel.Click();
    EXPECT_EQ(panel.Caption.get(), serving);
    form.cmdCancel.Click();
    EXPECT_EQ(panel.Caption.get(), "before");
    EXPECT_EQ(boxes.texts().back(),
              "Are you sure you want to close ZELRemote Server\r\nand disconnect client computer?");
}

TEST_F(Server, MenuEntry_ShowsTheWindow) {
    program.start();
    bool shownModally = false;
    later(10, [&] {
        shownModally = form.Visible && form.Modal;
        form.cmdCancel.Click();
    });
    panel.UtilityServer.Click();
    EXPECT_TRUE(shownModally);
    EXPECT_EQ(panel.StartT, 0);
}

TEST(ServerWord, Start_ConnectsByItselfAndClosingEndsTheProgram) {
    ServerBench bench("server");
    bench.identity();
    bench.line.expect("SET\r").answer("0\r");
    bench.line.expect("BAUD,2\r").answer("0\r");
    bench.noise();
    bench.identity();
    bool bridging = false;
    bench.later(30'000, [&] {
        bridging = bench.program.server().bridging();
        bench.form.cmdCancel.Click();
        bench.form.cmdCancel.Click();
    });
    bench.program.start();
    EXPECT_TRUE(bridging);
    EXPECT_TRUE(bench.program.ended());
}

TEST(ServerWord, FailedStart_LeavesTheWindowOpenWithTheBoxShown) {
    ServerBench bench("SERVER");
    bench.line.failOpen("away", 1);
    bool open = false;
    bench.later(5000, [&] {
        open = bench.form.Visible;
        bench.form.cmdCancel.Click();
    });
    bench.program.start();
    EXPECT_TRUE(open);
    EXPECT_EQ(bench.shown()[0],
              "warning | ZELRemote | Could not connect to the specified COM port!\r\naway");
}

TEST_F(Server, DayOfView_LeavesNothingWaiting) {
    bridge();
    enter();
    const std::string trace(1205, 't');
    for (int sweep = 0; sweep < 24 * 3600; ++sweep) {
        client.arrive("GET\r");
        line.arrive("0\r");
        run(11);
        client.arrive("TRACEBIN\r");
        line.arrive("0\r" + trace);
        run(989);
        ASSERT_EQ(program.server().relay().waiting(), 0U);
        ASSERT_LE(platform.events.pending(), 8U);
    }
    EXPECT_EQ(program.server().relay().sweeps(), 24U * 3600U);
    EXPECT_LE(form.lstEvents.Items.get().size(), 200U);
}

}  // namespace
}  // namespace zel
