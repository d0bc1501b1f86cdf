#include <gtest/gtest.h>

#include "connection/Devices.h"
#include "tests/connection/Bench.h"

namespace zel {
namespace {

struct DevicesTest : Connection {
    DevicesChoiceForm& form = forms.devicesChoice;

    DevicesTest() {
        platform.folder.folder = "/app";
        settings(
            "[devices]\nINIT1 = Modem, \"old\"\ninit2=Phone\nINIT3=1\nINIT4=never\n"
            "[Modem, \"old\"]\nINIT1=AT&F\nINIT2 = ATS0=0;E0\nINIT3=AT&W\n"
            "[Phone]\nINIT1=AT+CGATT=1\nINIT2=AT&W0\n");
    }

    void settings(const std::string& text) { platform.files.put("/app/settings.ini", text); }
    bool configure(const std::string& name) { return program.configureDevice(name, "COM3", 9600); }
};

TEST_F(DevicesTest, Names_AreReadToTheFirstNumber1) {
    EXPECT_EQ(program.deviceNames(), (Texts{"Modem, \"old\"", "Phone"}));
}

TEST_F(DevicesTest, FileWithoutTheSection_GivesNone) {
    settings("[Other]\nINIT1=x\n");
    EXPECT_EQ(program.deviceNames(), Texts{"NONE"});
}

TEST_F(DevicesTest, FileThatCannotBeRead_IsToldAndGivesNone) {
    platform.files.refuse("/app/settings.ini", "Permission denied");
    EXPECT_EQ(program.deviceNames(), Texts{"NONE"});
    EXPECT_EQ(shown(), Texts{"warning | ZELRemote | The file /app/settings.ini cannot be read: "
                             "Permission denied"});
}

TEST_F(DevicesTest, MenuEntry_FillsTheDialog) {
    later(1, [this] {
        EXPECT_TRUE(form.Modal);
        form.CloseDevicesButton.Click();
    });
    panel.SetDevice.Click();
    EXPECT_FALSE(form.Visible);
    EXPECT_EQ(form.AvailableDevicesChoice.items(), (Texts{"Modem, \"old\"", "Phone"}));
    EXPECT_EQ(form.DevicesPortList.items(), (Texts{"COM1", "COM3"}));
    EXPECT_EQ(form.DevicesPortList.Text(), "COM1");
    EXPECT_EQ(form.DevicesBaudList.items(),
              (Texts{"1200", "2400", "9600", "19200", "38400", "57600", "115200"}));
}

TEST_F(DevicesTest, Configure_SendsTheCommandsAsTheyStand) {
    port.expect("AT&F\r").answer("\r\nOK\r\n").after(300);
    port.expect("ATS0=0;E0\r").answer("O").answer("K\r").after(1000);
    port.expect("AT&W\r").silence();
    EXPECT_TRUE(configure("Modem, \"old\""));
    expectPlayed();
    EXPECT_EQ(shown(), Texts{"information | ZELRemote | Device configured."});
    EXPECT_FALSE(port.isOpen());
    ASSERT_EQ(port.openings().size(), 1U);
    EXPECT_EQ(port.openings()[0].Handshaking, 3);
    EXPECT_EQ(port.openings()[0].Settings, "9600,N,8,1");
}

TEST_F(DevicesTest, SilentDevice_IsToldAfter15Seconds) {
    port.expect("AT&F\r").silence();
    EXPECT_NEAR(static_cast<double>(time([this] { configure("Modem, \"old\""); })), 16'050, 100);
    EXPECT_EQ(shown(), Texts{"critical | ZELRemote | No device found at this port!"});
    EXPECT_FALSE(port.isOpen());
}

TEST_F(DevicesTest, RefusingDevice_IsToldWithItsWords) {
    port.expect("AT&F\r").answer("ERROR\r");
    EXPECT_FALSE(configure("Modem, \"old\""));
    ASSERT_EQ(boxes.texts().size(), 1U);
    EXPECT_EQ(boxes.texts()[0], "No device found at this port!\r\nCODE:\r\nERROR\r");
}

TEST_F(DevicesTest, AttachingToTheNet_MayTake20Seconds) {
    port.expect("AT+CGATT=1\r").answer("OK\r").after(19'000);
    port.expect("AT&W0\r").silence();
    EXPECT_TRUE(configure("Phone"));
}

TEST_F(DevicesTest, Commands_WithoutAnAnswerMatchExactly) {
    settings("[DEVICES]\nINIT1=A\n[A]\nINIT1=AT&W2\n");
    port.expect("AT&W2\r").silence();
    EXPECT_FALSE(configure("A"));
    EXPECT_EQ(shown(), Texts{"critical | ZELRemote | No device found at this port!"});
}

TEST_F(DevicesTest, DeviceThatGoes_IsToldOnce) {
    port.expect("AT&F\r").silence();
    later(3000, [this] { port.die(); });
    EXPECT_LT(time([this] { configure("Modem, \"old\""); }), 4000);
    EXPECT_EQ(shown(), Texts{"critical | ZELRemote | Port is not open!"});
}

TEST_F(DevicesTest, Closing_EndsTheConfigurationSilently) {
    port.expect("AT&F\r").silence();
    later(3000, [this] { form.CloseDevicesButton.Click(); });
    EXPECT_LT(time([this] { configure("Modem, \"old\""); }), 4000);
    EXPECT_EQ(shown(), Texts{});
    EXPECT_FALSE(port.isOpen());
}

TEST_F(DevicesTest, BadPortOrBaud_IsTold) {
    form.load();
    form.DevicesPortList.setText("COM");
    form.SetDeviceButton.Click();
    form.DevicesPortList.setText("COM3");
    form.DevicesBaudList.setText("fast");
    form.SetDeviceButton.Click();
    EXPECT_EQ(shown(), (Texts{"plain | ZELRemote | Please enter a valid COM port!",
                              "plain | ZELRemote | Please enter a valid baud rate!"}));
    EXPECT_TRUE(port.openings().empty());
}

TEST_F(DevicesTest, Baud_IsTakenFromTheLowestToTheHighest) {
    form.load();
    form.DevicesPortList.setText("COM3");
    port.failOpen("held");
    const Texts refused = {"plain | ZELRemote | Please enter a valid baud rate!"};
    for (const char* baud : {"", "0", "0.5", "-9600", "10000001", "1e300"}) {
        boxes.clear();
        form.DevicesBaudList.setText(baud);
        form.SetDeviceButton.Click();
        EXPECT_EQ(shown(), refused) << baud;
    }
    EXPECT_TRUE(port.openings().empty());
    for (const char* baud : {"1", " 9600 ", "10000000"}) {
        form.DevicesBaudList.setText(baud);
        form.SetDeviceButton.Click();
    }
    ASSERT_EQ(port.openings().size(), 3U);
    EXPECT_EQ(port.openings()[0].Settings, "1,N,8,1");
    EXPECT_EQ(port.openings()[1].Settings, "9600,N,8,1");
    EXPECT_EQ(port.openings()[2].Settings, "10000000,N,8,1");
}

}  // namespace
}  // namespace zel
