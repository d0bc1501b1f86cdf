#include <gtest/gtest.h>

#include "tests/connection/Bench.h"

namespace zel {
namespace {

using CF = ControllerForm;

struct Section {
    std::int16_t kind;
    const char* name;
    bool dialled;
};
constexpr Section kSections[] = {{CF::DIRECTCON, "DIRECTCON", false},
                                 {CF::MODEMCON, "MODEMCON", true},
                                 {CF::GSMCON, "GSMCON", true},
                                 {CF::MODEMGSMCON, "MODEMGSMCON", true},
                                 {CF::GSMMODEMCON, "GSMMODEMCON", true}};

struct ProfilesTest : Connection {
    ProfilesTest() { dialog.load(); }
    std::string stored(const std::string& section, const std::string& key) {
        return platform.settings.get("ZELRemote", section, key, "absent");
    }
    void store(const std::string& section, const std::string& key, const std::string& value) {
        platform.settings.set("ZELRemote", section, key, value);
    }
};

TEST_F(ProfilesTest, Save_EachKind_HasASectionOfItsOwn) {
    for (const Section& section : kSections) {
        panel.ConnectionState = section.kind;
        dialog.COMList.setListIndex(1);
        dialog.BaudList.setListIndex(3);
        dialog.TelNumberBox.Text = "0123";
        dialog.SaveSettingsButton.Click();
        EXPECT_EQ(stored(section.name, "CommPort"), "1") << section.name;
        EXPECT_EQ(stored(section.name, "BaudRate"), "3") << section.name;
        EXPECT_EQ(stored(section.name, "TelNumber"), section.dialled ? "0123" : "absent")
            << section.name;
    }
}

TEST_F(ProfilesTest, Load_EachKind_FillsTheFieldsFromItsSection) {
    for (const Section& section : kSections) {
        panel.ConnectionState = section.kind;
        store(section.name, "CommPort", "1");
        store(section.name, "BaudRate", "2");
        store(section.name, "TelNumber", section.name);
        dialog.TelNumberBox.Text = "old";
        dialog.LoadSettingsButton.Click();
        EXPECT_EQ(dialog.COMList.Text(), "COM3") << section.name;
        EXPECT_EQ(dialog.BaudList.Text(), "57600") << section.name;
        EXPECT_EQ(dialog.TelNumberBox.Text.get(), section.dialled ? section.name : "old");
    }
}

TEST_F(ProfilesTest, Load_EmptyStore_GivesTheFirstEntriesAndNoNumber) {
    panel.ConnectionState = CF::MODEMCON;
    dialog.COMList.setListIndex(1);
    dialog.BaudList.setListIndex(1);
    dialog.TelNumberBox.Text = "old";
    dialog.LoadSettingsButton.Click();
    EXPECT_EQ(dialog.COMList.ListIndex(), 0);
    EXPECT_EQ(dialog.BaudList.ListIndex(), 0);
    EXPECT_EQ(dialog.TelNumberBox.Text.get(), "");
}

TEST_F(ProfilesTest, Load_IndexOutsideTheList_GivesIndex0) {
    panel.ConnectionState = CF::DIRECTCON;
    for (const char* index : {"2", "99", "-1", "1e300", "junk", ""}) {
        store("DIRECTCON", "CommPort", index);
        store("DIRECTCON", "BaudRate", std::string(index) == "2" ? "4" : index);
        dialog.COMList.setListIndex(1);
        dialog.BaudList.setListIndex(1);
        dialog.LoadSettingsButton.Click();
        EXPECT_EQ(dialog.COMList.ListIndex(), 0) << index;
        EXPECT_EQ(dialog.BaudList.ListIndex(), 0) << index;
    }
}

TEST_F(ProfilesTest, TypedNames_AreKeptBesideTheIndices) {
    panel.ConnectionState = CF::DIRECTCON;
    dialog.COMList.setText("/dev/pts/7");
    dialog.BaudList.setText("9600");
    dialog.SaveSettingsButton.Click();
    dialog.unload(1);
    dialog.load();
    EXPECT_EQ(dialog.COMList.Text(), "COM1");
    dialog.LoadSettingsButton.Click();
    EXPECT_EQ(dialog.COMList.Text(), "/dev/pts/7");
    EXPECT_EQ(dialog.BaudList.Text(), "9600");
}

TEST_F(ProfilesTest, PickedEntryAfterATypedOne_IsTheOneThatCounts) {
    panel.ConnectionState = CF::DIRECTCON;
    dialog.COMList.setText("/dev/pts/7");
    dialog.SaveSettingsButton.Click();
    dialog.COMList.pick(1);
    dialog.SaveSettingsButton.Click();
    dialog.COMList.setText("");
    dialog.LoadSettingsButton.Click();
    EXPECT_EQ(dialog.COMList.Text(), "COM3");
}

TEST_F(ProfilesTest, Tcp_HasNoSectionHere) {
    panel.ConnectionState = CF::TCPCON;
    dialog.SaveSettingsButton.Click();
    EXPECT_TRUE(platform.settings.values.empty());
}

TEST_F(ProfilesTest, DirectConnection_ThatFails_StoresTheFieldsAllTheSame) {
    port.expect("\r").silence();
    EXPECT_FALSE(connect());
    EXPECT_EQ(stored("DIRECTCON", "CommPort"), "1");
    EXPECT_EQ(stored("DIRECTCON", "BaudRate"), "2");
}

}  // namespace
}  // namespace zel
