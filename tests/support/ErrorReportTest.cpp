#include <gtest/gtest.h>

#include <new>
#include <system_error>

#include "platform/virtual/VirtualPlatform.h"
#include "support/ErrorReport.h"
#include "support/RunTimeError.h"
#include "support/SupportAddress.h"
#include "support/Text.h"
#include "support/cRegistry.h"

namespace zel {
namespace {

template <class Thrown>
RuntimeFailure failureOf(const Thrown& thrown) {
    try {
        throw thrown;
    } catch (...) {
        return currentFailure();
    }
}

TEST(CurrentFailure, NumberAndSource_AreTheFailuresOwnOrTheUsualOnes) {
    const RuntimeFailure own = failureOf(RunTimeError(13, "Bridge", "type mismatch"));
    EXPECT_EQ(own.number, 13);
    EXPECT_EQ(own.source, "Bridge");
    EXPECT_EQ(own.description, "type mismatch");
    const RuntimeFailure plain = failureOf(std::runtime_error("no room"));
    EXPECT_EQ(plain.number, 5);
    EXPECT_EQ(plain.source, "ZELRemote");
    EXPECT_EQ(plain.description, "no room");
    EXPECT_EQ(failureOf(RegistryError("no key")).source, "ZELRemote.cRegistry");
    EXPECT_EQ(failureOf(std::system_error(ENOSPC, std::generic_category())).number, ENOSPC);
    EXPECT_EQ(failureOf(std::bad_alloc()).number, 5);
    EXPECT_EQ(failureOf(7).description, "The reason is unknown.");
}

TEST(CaptionText, DoubleSign_IsOneAndASingleOneGoes) {
    EXPECT_EQ(captionText("Marlow && Tenby"), "Marlow & Tenby");
    EXPECT_EQ(captionText("&Copy to clipboard"), "Copy to clipboard");
    EXPECT_EQ(captionText("&"), "&");
}

struct ErrorReportTest : ::testing::Test {
    /// Runs what a user does while the window is open, then closes it.
    void display(const std::function<void()>& user = {}) {
        platform.events.schedule(10, [this, user] {
            open = form.Visible;
            if (user) user();
            form.ButtonOK.Click();
        });
        report.DisplayError({13, "Bridge", "type mismatch"}, {"server.Listen", "MTStandard.Now"});
    }
    VirtualPlatform platform;
    ErrorForm form;
    ErrorReport report{form,
                       {platform.clipboard, platform.fileDialogs, platform.files, platform.boxes,
                        platform.events}};
    bool open = false;
    const std::string wanted =
        "SOURCE      : Bridge\r\nNUMBER      : 13 = &HD\r\nDESCRIPTION : type mismatch\r\n"
        "CALLER STACK:\r\n>server.Listen\r\n >MTStandard.Now\r\n";
};

TEST_F(ErrorReportTest, Window_HoldsTheReportLineByLine) {
    display();
    EXPECT_TRUE(open);
    EXPECT_FALSE(form.Visible);
    EXPECT_TRUE(form.isOpen);
    EXPECT_EQ(form.reportText, wanted);
    EXPECT_EQ(form.Info(1).Text.get(), "NUMBER      : 13 = &HD");
    EXPECT_EQ(form.CallerList.Items.get(),
              (std::vector<std::string>{">server.Listen", " >MTStandard.Now"}));
    EXPECT_EQ(form.Label(0).Caption.get(),
              "ZELRemote has encounted a problem and needs to close. We are sorry for the "
              "inconvenience.");
    EXPECT_EQ(form.Label(1).Caption.get(), "Please tell Marlow && Tenby about this problem:");
    EXPECT_EQ(form.Label(4).Caption.get(), "\r\nPlease mail it to support@zelremote.example.");
}

TEST_F(ErrorReportTest, NegativeNumber_IsShownInFull) {
    platform.events.schedule(10, [this] { form.ButtonOK.Click(); });
    report.DisplayError({-1, "X", "Y"}, {});
    EXPECT_TRUE(contains(form.reportText, "NUMBER      : -1 = &HFFFFFFFF\r\n"));
}

TEST_F(ErrorReportTest, Copy_PutsTheReportOnTheClipboardAndSaysSo) {
    display([this] { form.CopyToClipboard.Click(); });
    EXPECT_EQ(platform.clipboard.text(), wanted);
    EXPECT_EQ(platform.boxes.texts(),
              std::vector<std::string>{"Support informations copied to clipboard.\r\n"
                                       "  Please mail to support@zelremote.example"});
}

TEST_F(ErrorReportTest, Session_IsAttachedWhenAskedForAndTakenOffAgain) {
    report.sessionLines = [] { return std::vector<std::string>(250, "0.000000 click A"); };
    display([this] {
        EXPECT_TRUE(form.chkAttachLog.Enabled);
        form.chkAttachLog.Click();
        EXPECT_EQ(split(form.reportText, '\n').size(), 6U + 1 + 200 + 1);
        form.chkAttachLog.Click();
        EXPECT_EQ(form.reportText, wanted);
    });
}

TEST_F(ErrorReportTest, WithoutASession_NothingCanBeAttached) {
    display([this] { EXPECT_FALSE(form.chkAttachLog.Enabled); });
}

TEST_F(ErrorReportTest, Save_WritesTheReportAndReportsAFailure) {
    platform.files.putFolder("/full");
    platform.fileDialogs.answer("/report.txt");
    platform.fileDialogs.answer("/full/report.txt");
    platform.files.refuse("/full", "No space left on device");
    display([this] {
        form.cmdSaveReport.Click();
        form.cmdSaveReport.Click();
        form.cmdSaveReport.Click();  // cancelled
    });
    EXPECT_EQ(platform.files.bytes("/report.txt"), wanted);
    EXPECT_EQ(platform.boxes.texts(),
              std::vector<std::string>{
                  "The file /full/report.txt cannot be written: No space left on device"});
}

TEST_F(ErrorReportTest, FrontWithoutWindows_GetsTheText) {
    std::string printed;
    report.print = [&](const std::string& text) { printed = text; };
    report.DisplayError({13, "Bridge", "type mismatch"}, {"server.Listen", "MTStandard.Now"});
    EXPECT_EQ(printed, wanted);
    EXPECT_FALSE(form.Visible);
}

TEST_F(ErrorReportTest, SecondFailureWhileItIsOpen_ChangesNothing) {
    display([this] { report.DisplayError({7, "Other", "other"}, {}); });
    EXPECT_EQ(form.reportText, wanted);
}

}  // namespace
}  // namespace zel
