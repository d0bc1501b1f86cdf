#include <gtest/gtest.h>

#include "tests/link/Line.h"

namespace zel {
namespace {

const char* const kSocketBox =
    "critical | ZELRemote | TCP/IP Socket error\r\nPlease make a new connection.\r\nThe other end "
    "closed the connection.";

TEST(PrependBytes, Count_MakesRoomWithTheByteFirstAndZerosBehind) {
    std::string bytes = "ab";
    PrependBytes(bytes, 3, '0');
    EXPECT_EQ(bytes, std::string("0\0\0ab", 5));
}

TEST(PrependBytes, One_PutsTheByteAhead) {
    std::string bytes = "\rabc";
    PrependBytes(bytes, 1, '0');
    EXPECT_EQ(bytes, "0\rabc");
}

TEST(PrependBytes, EmptyArray_HoldsTheByteAlone) {
    std::string bytes;
    PrependBytes(bytes, 1, '1');
    EXPECT_EQ(bytes, "1");
}

TEST(PrependBytes, None_LeavesTheArray) {
    std::string bytes = "ab";
    PrependBytes(bytes, 0, '0');
    EXPECT_EQ(bytes, "ab");
}

struct Bytes : Line {
    std::string got;
    /// Bytes that arrive by themselves, from now on.
    void comes(int ms, const std::string& what) {
        events.schedule(ms, [this, what] {
            port.arrive(what);
            socket.arrive(what);
        });
    }
    std::int64_t read(std::int16_t length) {
        return time([&] { got = byteReader.ReadBinaryBytes(length); });
    }
};

TEST_F(Bytes, StatusAndItsCr_AreDroppedUnseen) {
    state.TCPDataArrived = true;
    comes(0, "0\rabcdefghij");
    read(10);
    EXPECT_EQ(got, "abcdefghij");
    EXPECT_FALSE(state.TCPDataArrived);
    EXPECT_FALSE(state.RestFound) << "all of it was asked for";
    EXPECT_FALSE(state.AnswerOverdue);
}

TEST_F(Bytes, OneByteFirst_IsJoinedWithTheNextChunk) {
    comes(0, "0");
    comes(50, "\rabcdefghij");
    read(10);
    EXPECT_EQ(got, "abcdefghij");
}

TEST_F(Bytes, BareStatusFirst_SamplesComeWithTheNextChunk) {
    comes(0, "0\r");
    comes(1000, "abcdefghij");
    read(10);
    EXPECT_EQ(got, "abcdefghij");
}

TEST_F(Bytes, RefusalWithItsCr_IsTheResult) {
    for (const char digit : {'1', '2', '3', '4', '5', '6', '7'}) {
        const std::string refusal = std::string(1, digit) + "\r";
        state.TCPDataArrived = true;
        comes(0, refusal);
        EXPECT_LE(read(10), 20);
        EXPECT_EQ(got, refusal);
        EXPECT_FALSE(state.TCPDataArrived);
    }
}

TEST_F(Bytes, RefusalInTwoChunks_IsTheResult) {
    comes(0, "1");
    comes(300, "\r");
    EXPECT_EQ(read(10), 320);
    EXPECT_EQ(got, "1\r");
}

TEST_F(Bytes, Silence_EndsAfterFiveSecondsWithNothing) {
    const std::int64_t ms = read(10);
    EXPECT_GE(ms, 5000);
    EXPECT_LE(ms, 5050);
    EXPECT_EQ(got, "");
    EXPECT_EQ(shown(), Texts{});
}

TEST_F(Bytes, Stop_InTheMiddle_GivesWhatCameFiveSecondsLater) {
    comes(0, "0\rabc");
    comes(4000, "def");
    const std::int64_t ms = read(20);
    EXPECT_GE(ms, 9000);
    EXPECT_LE(ms, 9050);
    EXPECT_EQ(got, "abcdef");
}

TEST_F(Bytes, PausesBelowFiveSeconds_AreBridged) {
    comes(0, "0\rabc");
    comes(4900, "def");
    comes(9800, "ghij");
    read(10);
    EXPECT_EQ(got, "abcdefghij");
}

TEST_F(Bytes, MoreThanAskedFor_IsCutAtTheLength) {
    comes(0, "0\rabcdefghijKLMN");
    EXPECT_EQ(read(10), 0) << "no wait for last bytes";
    EXPECT_EQ(got, "abcdefghij");
    EXPECT_TRUE(state.RestFound);
    EXPECT_TRUE(state.AnswerOverdue);
}

TEST_F(Bytes, LastBytesOfASlowLine_AreWaitedFor) {
    comes(0, "0\rabcdefgh");
    comes(100, "i");
    comes(190, "j");
    EXPECT_EQ(read(10), 190);
    EXPECT_EQ(got, "abcdefghij");
}

TEST_F(Bytes, LastBytesThatNeverCome_AreWaitedForAFifthOfASecond) {
    comes(0, "0\rabcdefgh");
    const std::int64_t ms = read(10);
    EXPECT_GE(ms, 200);
    EXPECT_LE(ms, 250);
    EXPECT_EQ(got, "abcdefgh");
}

TEST_F(Bytes, ChunkAtHandNearTheEnd_IsKept) {
    comes(0, "0\rabcdef");
    comes(10, "ghij");
    EXPECT_EQ(read(10), 10);
    EXPECT_EQ(got, "abcdefghij");
}

TEST_F(Bytes, PortDiesInTheMiddle_EndsAtOnce) {
    comes(0, "0\rabc");
    events.schedule(500, [this] { port.die(); });
    EXPECT_LE(read(10), 520);
    EXPECT_EQ(got, "abc");
}

TEST_F(Bytes, NoUsableLink_IsToldOnce) {
    dialog.IsConnectedToPort = false;
    state.TCPDataArrived = true;
    EXPECT_EQ(read(10), 0);
    EXPECT_FALSE(state.TCPDataArrived);
    read(10);
    EXPECT_EQ(got, "");
    EXPECT_EQ(shown(), Texts{"critical | ZELRemote | Not Connected To Port!"});
    EXPECT_TRUE(panel.ErrorFlag);
}

TEST_F(Bytes, Chunk_IsWhatHasComeAsSoonAsSomethingHas) {
    comes(700, "ab");
    comes(701, "cd");
    EXPECT_EQ(time([&] { EXPECT_EQ(byteReader.ReadBinaryChunk(5), "ab"); }), 700);
}

TEST_F(Bytes, Chunk_Silence_LastsTheSecondsAsked) {
    const std::int64_t ms = time([&] { EXPECT_EQ(byteReader.ReadBinaryChunk(2), ""); });
    EXPECT_GE(ms, 2000);
    EXPECT_LE(ms, 2050);
}

TEST_F(Bytes, Buffer_ClosedPort_IsToldAndEmpty) {
    port.close();
    EXPECT_EQ(byteReader.ReadBinaryBuffer(1205), "");
    EXPECT_EQ(shown(), Texts{"critical | ZELRemote | Port is not open!"});
    EXPECT_EQ(status(), "BIN-BUFFER-LEN: -1");
}

TEST_F(Bytes, Buffer_RunsWhatIsDueBeforeItsLine) {
    port.close();
    std::string line = "nothing ran";
    events.schedule(0, [&] { line = status(); });
    byteReader.ReadBinaryBuffer(1205);
    EXPECT_EQ(line, "");
}

TEST_F(Bytes, Buffer_LineShowsTheLastIndex) {
    comes(0, "0\rabcdefghij");
    EXPECT_EQ(byteReader.ReadBinaryBuffer(10), "abcdefghij");
    EXPECT_EQ(status(), "BIN-BUFFER-LEN:  9");
}

struct TcpBytes : Bytes {
    TcpBytes() { overTcp(); }
};

TEST_F(TcpBytes, Transfer_IsReadFromTheSocketWithThePortClosed) {
    comes(20, "0\rabc");
    comes(40, "defghij");
    EXPECT_EQ(read(10), 40);
    EXPECT_EQ(got, "abcdefghij");
    EXPECT_FALSE(state.TCPDataArrived);
    EXPECT_EQ(byteReader.ReadBinaryBuffer(0), "");
    EXPECT_EQ(shown(), Texts{});
}

TEST_F(TcpBytes, OneByteFirst_IsJoinedWithTheNextChunk) {
    comes(0, "0");
    comes(50, "\rabcdefghij");
    read(10);
    EXPECT_EQ(got, "abcdefghij");
}

TEST_F(TcpBytes, Silence_EndsAfterFiveSecondsWithNothing) {
    const std::int64_t ms = read(10);
    EXPECT_GE(ms, 5000);
    EXPECT_LE(ms, 5050);
    EXPECT_EQ(got, "");
}

TEST_F(TcpBytes, SocketDies_IsToldOnceWithItsReason_AndGivesWhatCame) {
    comes(0, "0\rabc");
    events.schedule(100, [this] { socket.peerCloses(); });
    EXPECT_LE(read(10), 120);
    EXPECT_EQ(got, "abc");
    EXPECT_EQ(shown(), Texts{kSocketBox});
    EXPECT_FALSE(state.TCPDataArrived);
    EXPECT_TRUE(panel.CWGraph1.Old);
    EXPECT_EQ(read(10), 0);
    EXPECT_EQ(shown().size(), 1U);
}

TEST_F(TcpBytes, SocketDiesBehindTheLastByte_GivesAll) {
    comes(0, "0\rabcdefghij");
    events.schedule(0, [this] { socket.peerCloses(); });
    read(10);
    EXPECT_EQ(got, "abcdefghij");
    EXPECT_EQ(shown(), Texts{});
}

}  // namespace
}  // namespace zel
