#include <string>

#include "support/INIIO.h"
#include "support/IniSettingsStore.h"
#include "tests/support/Stores.h"

namespace zel {
namespace {

class Settings : public Stores {
  protected:
    IniSettingsStore settings() const { return IniSettingsStore(file("user.ini")); }
};

TEST_F(Settings, Get_AbsentKey_GivesTheFallback) {
    EXPECT_EQ(settings().get("ZELRemote", "Properties", "Option", ""), "");
    EXPECT_EQ(settings().get("ZELRemote", "Properties", "Option", "R"), "R");
    EXPECT_EQ(files(), 0);
}

TEST_F(Settings, Set_Value_IsThereForTheNextProgram) {
    ASSERT_TRUE(settings().set("ZELRemote", "Properties", "Option", "R"));
    EXPECT_EQ(settings().get("ZELRemote", "Properties", "Option", "none"), "R");
}

TEST_F(Settings, Get_EmptyValue_IsNoAbsentOne) {
    ASSERT_TRUE(settings().set("ZELRemote", "DIRECT", "TelNumber", ""));
    EXPECT_EQ(settings().get("ZELRemote", "DIRECT", "TelNumber", "none"), "");
}

TEST_F(Settings, ApplicationsAndSections_AreApart) {
    ASSERT_TRUE(settings().set("A", "B", "x", "1"));
    EXPECT_EQ(settings().get("A", "C", "x", "none"), "none");
    EXPECT_EQ(settings().get("C", "B", "x", "none"), "none");
    EXPECT_EQ(read(file("user.ini")), "[A/B]\r\nx=1\r\n");
}

TEST_F(Settings, LongValue_IsNotCut) {
    const std::string path(2000, 'p');
    ASSERT_TRUE(settings().set("A", "B", "x", path));
    EXPECT_EQ(settings().get("A", "B", "x", ""), path);
}

TEST_F(Settings, Set_OtherLines_Stay) {
    ASSERT_TRUE(settings().set("A", "B", "x", "1"));
    ASSERT_TRUE(WriteIni(file("user.ini"), "Own", "note", std::string("kept")));
    ASSERT_TRUE(settings().set("A", "B", "x", "2"));
    EXPECT_EQ(read(file("user.ini")), "[A/B]\r\nx=2\r\n[Own]\r\nnote=kept\r\n");
}

TEST_F(Settings, Set_WithoutAFolder_FailsAndGetGivesTheFallback) {
    IniSettingsStore lost(file("no/such/user.ini"));
    EXPECT_FALSE(lost.set("A", "B", "x", "1"));
    EXPECT_EQ(lost.get("A", "B", "x", "none"), "none");
}

}  // namespace
}  // namespace zel
