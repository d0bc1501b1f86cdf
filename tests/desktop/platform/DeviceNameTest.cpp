// Names of devices, on the real system.

#include <gtest/gtest.h>
#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <string>

#include "desktop/platform/DeviceName.h"

namespace zel {
namespace {

/// A working folder of its own.
struct DeviceNames : ::testing::Test {
    DeviceNames() {
        std::filesystem::create_directory(folder);
        std::filesystem::current_path(folder);
    }
    ~DeviceNames() override {
        std::filesystem::current_path(before);
        std::filesystem::remove_all(folder);
    }
    const std::filesystem::path before = std::filesystem::current_path();
    const std::filesystem::path folder =
        std::filesystem::canonical(std::filesystem::temp_directory_path()) /
        ("zel-names-" + std::to_string(::getpid()));
};

TEST_F(DeviceNames, LinkInTheWorkingFolder_IsTakenByItsWholePath) {
    std::filesystem::create_symlink("/dev/null", folder / "instrument");
    const std::string whole = (folder / "instrument").string();
    EXPECT_EQ(devicePath("instrument"), whole);
    EXPECT_EQ(devicePath("./instrument"), whole);
    EXPECT_EQ(devicePath("../" + folder.filename().string() + "/instrument"), whole);
}

TEST_F(DeviceNames, NameBelowDev_NeedsNoFolder) {
    EXPECT_EQ(devicePath("null"), "/dev/null");
    // A folder of that name in the working folder is no device.
    std::filesystem::create_directory(folder / "null");
    EXPECT_EQ(devicePath("null"), "/dev/null");
}

TEST_F(DeviceNames, DeviceThatIsNotThere_HasThePathThatWasLookedFor) {
    EXPECT_EQ(devicePath("ttyUSB77"), "/dev/ttyUSB77");
    EXPECT_EQ(devicePath("sub/port"), (folder / "sub" / "port").string());
}

TEST_F(DeviceNames, OtherNames_StandAsTheyAre) {
    for (const char* name : {"", " ", "COM", "COM3", "com12", "/dev/ttyS0", "//x"})
        EXPECT_EQ(devicePath(name), name);
}

TEST_F(DeviceNames, HostOfTheNetwork_IsNoDevice) {
    std::ofstream(folder / "server") << "x";
    LinkAddress address{LinkAddress::Kind::Tcp, "server", 2277};
    useDevicePath(address);
    EXPECT_EQ(address.port, "server");
    address.kind = LinkAddress::Kind::TwoModems;
    useDevicePath(address);
    EXPECT_EQ(address.port, (folder / "server").string());
}

}  // namespace
}  // namespace zel
