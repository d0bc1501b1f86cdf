// What the system knows of its ports, asked about pseudo terminals.

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <cstdlib>
#include <string>

#include "desktop/platform/SystemPortProbe.h"
#include "tests/files/DiskFolder.h"

namespace zel {
namespace {

struct PortProbeTest : ::testing::Test {
    PortProbeTest() : far(::posix_openpt(O_RDWR | O_NOCTTY | O_CLOEXEC)) {
        if (far < 0 || ::grantpt(far) != 0 || ::unlockpt(far) != 0) return;
        path = ::ptsname(far);
    }
    ~PortProbeTest() override {
        if (far >= 0) ::close(far);
    }
    int far;
    std::string path;
    SystemPortProbe probe;
};

TEST_F(PortProbeTest, PseudoTerminal_IsAPortThatNobodyHoldsBecauseOfItsFarSide) {
    ASSERT_FALSE(path.empty());
    const PortAccess access = probe.access(path);
    EXPECT_TRUE(access.exists);
    EXPECT_TRUE(access.terminal);
    EXPECT_TRUE(access.usable);
    EXPECT_TRUE(probe.holders(path).found.empty());
    EXPECT_FALSE(probe.modemLines(path));
}

TEST_F(PortProbeTest, PortThatAnotherProcessHasOpen_IsHeldByThat) {
    ASSERT_FALSE(path.empty());
    int ready[2];
    ASSERT_EQ(::pipe(ready), 0);
    const pid_t child = ::fork();
    ASSERT_GE(child, 0);
    if (child == 0) {
        const int near = ::open(path.c_str(), O_RDWR | O_NOCTTY);
        ::close(far);  // who has both sides is none
        const bool told = near >= 0 && ::write(ready[1], "x", 1) == 1;
        ::pause();
        ::_exit(told ? 0 : 1);
    }
    char letter = 0;
    EXPECT_EQ(::read(ready[0], &letter, 1), 1);
    const PortHolders holders = probe.holders(path);
    ::kill(child, SIGKILL);
    ::waitpid(child, nullptr, 0);
    for (const int end : ready) ::close(end);
    ASSERT_EQ(holders.found.size(), 1U);
    EXPECT_FALSE(holders.found.front().self);
    EXPECT_EQ(holders.found.front().process, child);
    EXPECT_TRUE(probe.holders(path).found.empty());
}

TEST_F(PortProbeTest, WhatIsNoPort_IsSaidToBeNone) {
    DiskFolder folder;
    folder.write("file", "");
    EXPECT_FALSE(probe.access("/dev/nothing.there").exists);
    for (const std::string& other :
         {std::string("/dev/null"), std::string("/dev/tty"), std::string("/dev/ptmx"),
          std::string("/"), folder.file("file")}) {
        const PortAccess access = probe.access(other);
        EXPECT_TRUE(access.exists) << other;
        EXPECT_FALSE(access.terminal) << other;
    }
}

}  // namespace
}  // namespace zel
