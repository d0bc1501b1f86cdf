#include <gtest/gtest.h>

#include <algorithm>

#include "platform/virtual/VirtualPlatform.h"
#include "support/AboutBox.h"
#include "support/Text.h"
#include "support/VersionInfo.h"

namespace zel {
namespace {

using Texts = std::vector<std::string>;

struct AboutBoxTest : ::testing::Test {
    AboutBoxTest() { platform.files.putFolder("/home"); }
    void show(const std::function<void()>& user = {}) {
        platform.events.schedule(10, [this, user] {
            if (user) user();
            form.ButtonOK.Click();
        });
        about.show();
        form.unload(0);
    }
    VirtualPlatform platform;
    AboutForm form;
    AboutBox about{form,
                   {platform.machine, platform.files, platform.clock, platform.clipboard,
                    platform.launcher, platform.boxes, platform.events},
                   "/home/registry.ini"};
};

TEST_F(AboutBoxTest, Report_HasItsGroupsInOneColumn) {
    platform.machine.known.operatingSystem = "System 1, kernel 2";
    platform.machine.known.installed = dateOf(2025, 3, 31, 23, 59, 58);
    platform.machine.known.language = "de";
    show();
    EXPECT_EQ(form.SystemInfo.Text.get(),
              "*** GLOBAL SETUP ***\r\n"
              "Product:            ZELRemote\r\n"
              "Version:            1.0\r\n"
              "Date:               2026-01-01\r\n\r\n"
              "*** Operating system ***\r\n"
              "Operating system:   System 1, kernel 2\r\n"
              "Installed           31.03.2025 23:59:58\r\n"
              "Admin rights        NO\r\n\r\n"
              "*** Language settings ***\r\n"
              "Country             -\r\n"
              "Language            de\r\n"
              "Locale              -\r\n"
              "Local ID            -\r\n\r\n"
              "*** DLL and EXE versions ***\r\n"
              "Virtual library     1.0\r\n"
              "CVI runtime         not installed\r\n"
              "MSI service         not installed\r\n"
              "Internet Explorer   not installed\r\n\r\n");
}

TEST_F(AboutBoxTest, MachineWithoutDrivers_ShowsTheNotInstalledLines) {
    show();
    EXPECT_EQ(form.DriverInfo.Text.get(),
              "*** NI ActiveX versions ***\r\n"
              "NI Analysis         not installed\r\n"
              "NI UI               not installed\r\n"
              "NI 3D graph         not installed\r\n\r\n"
              "*** Remote Control ***\r\n"
              "IEEE BUS IS NOT INSTALLED\r\n"
              "VISA IS NOT INSTALLED\r\n"
              "Secondary VISA      not installed\r\n"
              "Instrument drivers  not installed\r\n\r\n"
              "*** VXI plug and play drivers ***\r\nnone\r\n\r\n"
              "*** IVI drivers ***\r\nnone\r\n\r\n"
              "*** USB drivers ***\r\nnone\r\n\r\n");
    EXPECT_TRUE(contains(form.SystemInfo.Text.get(), "Installed           unknown\r\n"));
}

TEST_F(AboutBoxTest, Drivers_AreListedFromTheFoldersThatTheEnvironmentNames) {
    platform.machine.variables["FRAMEWORK_PATH"] = "/vxipnp";
    platform.files.put("/vxipnp/b.DLL", "");
    platform.files.put("/vxipnp/a.dll", "");
    platform.files.put("/vxipnp/lib/c.dll", "");
    platform.files.put("/vxipnp/.hidden", "");
    platform.files.put("/programs/IVI/Bin/driver.so", "");
    platform.files.put("/usb/analyser.rules", "");
    platform.machine.variables["ProgramFilesDir"] = "/programs";
    platform.machine.variables["USB_DRIVER_PATH"] = "/usb";
    platform.machine.known.ieeeDriver = "/dev/gpib0";
    show();
    EXPECT_TRUE(contains(form.DriverInfo.Text.get(),
                         "*** VXI plug and play drivers ***\r\na.dll\r\nb.DLL\r\n\r\n"
                         "*** IVI drivers ***\r\ndriver.so\r\n\r\n"
                         "*** USB drivers ***\r\nanalyser.rules\r\n\r\n"))
        << form.DriverInfo.Text.get();
    EXPECT_TRUE(contains(form.DriverInfo.Text.get(), "IEEE driver         /dev/gpib0\r\n"));
}

TEST_F(AboutBoxTest, Parts_AreShownAndHiddenByTheirKeys) {
    show([this] {
        EXPECT_FALSE(form.SystemInfo.Visible);
        EXPECT_EQ(form.ShowSystemInfo.Caption.get(), "show system information");
        form.ShowSystemInfo.Click();
        EXPECT_TRUE(form.SystemInfo.Visible);
        EXPECT_EQ(form.ShowSystemInfo.Caption.get(), "hide system information");
        form.ShowLegalNotes.Click();
        EXPECT_TRUE(form.LegalNotes.Visible);
        EXPECT_TRUE(form.SystemInfo.Visible) << "each part for itself";
        EXPECT_FALSE(form.DriverInfo.Visible);
        form.ShowLegalNotes.Click();
        EXPECT_TRUE(form.SystemInfo.Visible);
        EXPECT_FALSE(form.LegalNotes.Visible);
        EXPECT_EQ(form.ShowLegalNotes.Caption.get(), "show legal notes");
    });
}

TEST_F(AboutBoxTest, CopiedText_IsWholeWhateverIsShown) {
    show([this] { form.CreateSupportString.Click(); });
    EXPECT_EQ(platform.clipboard.text(),
              form.SystemInfo.Text.get() + form.DriverInfo.Text.get() + form.LegalNotes.Text.get());
    EXPECT_EQ(platform.boxes.texts(),
              Texts{"Support information copied to clipboard.\r\nUse <CTRL-V> to paste the "
                    "information in your mail program or a text editor."});
}

constexpr const char* kLists =
    "*** VXI plug and play drivers ***\r\n/slow is still being read\r\n\r\n"
    "*** IVI drivers ***\r\nnone\r\n\r\n"
    "*** USB drivers ***\r\na.rules\r\n\r\n";

struct SlowFolderTest : AboutBoxTest {
    SlowFolderTest() {
        platform.machine.variables["FRAMEWORK_PATH"] = "/slow";
        platform.machine.variables["USB_DRIVER_PATH"] = "/usb";
        platform.files.put("/slow/b.dll", "");
        platform.files.put("/usb/a.rules", "");
        platform.machine.slow["/slow"] = 1500;
    }
};

TEST_F(SlowFolderTest, Window_OpensAtOnceAndIsFilledLater) {
    std::string first;
    form.Changed.connect([&] {
        if (first.empty() && form.Visible) first = form.DriverInfo.Text;
    });
    std::string later;
    platform.events.schedule(2000, [&] {
        later = form.DriverInfo.Text;
        form.ButtonOK.Click();
    });
    std::int64_t longest = 0;
    std::int64_t last = platform.clock.micros();
    std::function<void()> beat = [&] {
        longest = std::max(longest, platform.clock.micros() - last);
        last = platform.clock.micros();
        platform.events.schedule(1, beat);
    };
    beat();
    about.show();
    EXPECT_LT(longest, 100'000) << "the window was held";
    EXPECT_TRUE(contains(first, kLists)) << first;
    EXPECT_TRUE(contains(later, "drivers ***\r\nb.dll\r\n\r\n*** IVI")) << later;
}

TEST_F(SlowFolderTest, CopiedText_WaitsForTheFolder) {
    show([this] { form.CreateSupportString.Click(); });
    EXPECT_TRUE(contains(platform.clipboard.text(), "drivers ***\r\nb.dll\r\n\r\n*** IVI"));
    EXPECT_EQ(platform.boxes.texts().size(), 1U);
    EXPECT_TRUE(form.CreateSupportString.Enabled);
}

TEST_F(SlowFolderTest, FolderThatNeverComes_IsSaidToBeMissingInTheCopiedText) {
    platform.machine.slow["/slow"] = 100'000'000;
    show([this] { form.CreateSupportString.Click(); });
    EXPECT_TRUE(contains(platform.clipboard.text(), kLists)) << platform.clipboard.text();
    EXPECT_EQ(platform.boxes.texts().size(), 1U);
    EXPECT_LT(platform.clock.micros(), 4'000'000);
    EXPECT_EQ(platform.events.pending(), 0U) << "nobody looks at it any more";
}

TEST_F(SlowFolderTest, WindowThatIsClosed_CopiesNothing) {
    platform.events.schedule(500, [this] { form.ButtonOK.Click(); });
    platform.events.schedule(10, [this] { form.CreateSupportString.Click(); });
    about.show();
    EXPECT_EQ(platform.clipboard.text(), "");
    EXPECT_TRUE(platform.boxes.texts().empty());
    EXPECT_LT(platform.clock.micros(), 700'000);
}

TEST_F(AboutBoxTest, LongFolder_ListsItsFirstThousandFiles) {
    platform.machine.variables["USB_DRIVER_PATH"] = "/usb";
    for (int i = 0; i < 1010; ++i) platform.files.put("/usb/f" + std::to_string(10'000 + i), "");
    show();
    const std::string text = form.DriverInfo.Text;
    EXPECT_TRUE(contains(text, "f10000\r\nf10001\r\n"));
    EXPECT_TRUE(contains(text, "f10999\r\nand 10 more\r\n"));
}

TEST_F(AboutBoxTest, Spy_IsAskedForAndStartedWithItsOptions) {
    show([this] { form.StartNISpy.Click(); });
    EXPECT_EQ(platform.boxes.texts(), Texts{"NI Spy is not installed."});
}

TEST(VersionWords, FlagsAndTypes_AreNamed) {
    EXPECT_EQ(fileFlagsText(0), "");
    EXPECT_EQ(fileFlagsText(0x3F), "Debug PreRel Patched Private Info Special ");
    EXPECT_EQ(fileTypeText(1), "Application");
    EXPECT_EQ(fileTypeText(2), "DLL");
    EXPECT_EQ(fileTypeText(3), "Device Driver");
    EXPECT_EQ(fileTypeText(9), "");
}

TEST(VersionWords, SystemVersions_AreNamed) {
    EXPECT_EQ(windowsName(1, 4, 0), "Windows 95");
    EXPECT_EQ(windowsName(1, 4, 10), "Windows 98");
    EXPECT_EQ(windowsName(2, 4, 0), "Windows NT 4.0");
    EXPECT_EQ(windowsName(2, 5, 0), "Windows 2000");
    EXPECT_EQ(windowsName(2, 5, 1), "Windows XP / .NET Server");
    EXPECT_EQ(windowsName(2, 5, 2), "Windows XP / .NET Server");
    EXPECT_EQ(windowsName(3, 1, 0), "");
}

}  // namespace
}  // namespace zel
