// Ini files and what stands for the registry.

#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <vector>

#include "support/INIIO.h"
#include "support/IniFile.h"
#include "support/RegAccess.h"
#include "support/cRegistry.h"
#include "tests/support/Stores.h"

namespace zel {
namespace {

std::string textOf(const IniValue& value) { return std::get<std::string>(value); }

TEST_F(Stores, ReadIni_KeyThatIsNotThere_GivesTheDefault) {
    const std::string name = write("[A]\r\nx=1\r\n");
    EXPECT_EQ(textOf(ReadIni(disk_, name, "A", "y", std::string("none"))), "none");
    EXPECT_EQ(textOf(ReadIni(disk_, name, "B", "x", std::string("none"))), "none");
    EXPECT_EQ(textOf(ReadIni(disk_, file("absent.ini"), "A", "x", std::string("none"))), "none");
}

TEST_F(Stores, ReadIni_MissingDefault_CountsAsTheNumberOne) {
    const std::string name = write("");
    EXPECT_EQ(std::get<std::int16_t>(ReadIni(disk_, name, "A", "x")), 1);
    EXPECT_EQ(textOf(ReadIni(disk_, name, "A", "x", std::nullopt, IniType::Text)), "1");
}

TEST_F(Stores, ReadIni_NamesCompareWithoutCase) {
    EXPECT_EQ(
        textOf(ReadIni(disk_, write("[Devices]\nInit1=AT&F\n"), "DEVICES", "INIT1", std::string())),
        "AT&F");
}

TEST_F(Stores, ReadIni_TypeFollowsTheNameOrElseTheDefault) {
    const std::string name = write("[A]\nx=42.5 dBm\n");
    EXPECT_EQ(std::get<double>(ReadIni(disk_, name, "A", "x", 0.0)), 42.5);
    EXPECT_EQ(std::get<float>(ReadIni(disk_, name, "A", "x", 0.0F)), 42.5F);
    EXPECT_EQ(std::get<std::int32_t>(ReadIni(disk_, name, "A", "x", std::int32_t{0})), 42);
    EXPECT_EQ(std::get<std::int16_t>(ReadIni(disk_, name, "A", "x", 0.0, IniType::Integer)), 42);
    EXPECT_EQ(textOf(ReadIni(disk_, name, "A", "x", 0.0, IniType::Text)), "42.5 dBm");
}

TEST_F(Stores, ReadIni_NumberPastItsType_IsHeldAtTheEnd) {
    const std::string name = write("[A]\nx=99999999999\n");
    EXPECT_EQ(std::get<std::int16_t>(ReadIni(disk_, name, "A", "x", std::int16_t{0})), 32767);
}

TEST_F(Stores, ReadIni_WholeType_TakesTheNearestNumber) {
    const std::string name = write("[A]\nx=42.7\ny=-3.6\n");
    EXPECT_EQ(std::get<std::int16_t>(ReadIni(disk_, name, "A", "x", std::int16_t{0})), 43);
    EXPECT_EQ(std::get<std::int32_t>(ReadIni(disk_, name, "A", "y", std::int32_t{0})), -4);
}

TEST_F(Stores, ReadIni_DefaultOfAnotherType_IsTurnedIntoText) {
    const std::string name = write("");
    EXPECT_EQ(textOf(ReadIni(disk_, name, "A", "x", 2.5, IniType::Text)), "2.5");
    EXPECT_EQ(textOf(ReadIni(disk_, name, "A", "x", 0.1F, IniType::Text)), "0.1");
    EXPECT_EQ(textOf(ReadIni(disk_, name, "A", "x", true, IniType::Text)), "1");
    EXPECT_EQ(
        std::get<double>(ReadIni(disk_, name, "A", "x", std::string("7 dB"), IniType::Double)), 7);
}

TEST_F(Stores, ReadIni_TextWithoutANumber_GivesZero) {
    EXPECT_EQ(
        std::get<std::int32_t>(ReadIni(disk_, write("[A]\nx=on\n"), "A", "x", std::int32_t{5})), 0);
}

TEST_F(Stores, ReadIni_TrueTexts_ReadAsTrue) {
    for (const char* text : {"1", "TRUE", "true", "True", "Wahr", "WAHR"})
        EXPECT_TRUE(
            std::get<bool>(ReadIni(disk_, write(std::string("[A]\nx=") + text), "A", "x", false)))
            << text;
    for (const char* text : {"0", "2", "yes", ""})
        EXPECT_FALSE(
            std::get<bool>(ReadIni(disk_, write(std::string("[A]\nx=") + text), "A", "x", true)))
            << text;
}

TEST_F(Stores, ReadIni_LongValue_IsCutBehind750Characters) {
    const std::string name = write("[A]\nx=" + std::string(900, 'a') + "\n");
    EXPECT_EQ(textOf(ReadIni(disk_, name, "A", "x", std::string())).size(), 750U);
}

TEST_F(Stores, ReadIni_LongValueOfUmlauts_IsCutBetweenCharacters) {
    std::string umlauts;
    for (int i = 0; i < 800; ++i) umlauts += "ä";
    EXPECT_EQ(textOf(ReadIni(disk_, write("[A]\nx=" + umlauts), "A", "x", std::string())).size(),
              1500U);
}

TEST_F(Stores, ReadIni_QuotesAroundAValue_AreNoPartOfIt) {
    EXPECT_EQ(textOf(ReadIni(disk_, write("[A]\nx=\" a \"\n"), "A", "x", std::string())), " a ");
}

TEST_F(Stores, ReadIni_FileInWindows1252_IsReadAsSuch) {
    EXPECT_EQ(textOf(ReadIni(disk_, write("[A]\nx=\xB5V\n"), "A", "x", std::string())), "µV");
}

TEST_F(Stores, ReadIni_FileThatIsTooLarge_CountsAsEmpty) {
    const std::string name = write("[A]\nx=1\n" + std::string((1U << 20) + 1, ';'));
    EXPECT_EQ(textOf(ReadIni(disk_, name, "A", "x", std::string("none"))), "none");
}

TEST_F(Stores, WriteIni_LeavesAllOtherLinesAsTheyStand) {
    const std::string name = write("; head\r\n[A]\r\n x = 1 \r\ny=2\r\n\r\n[B]\r\nz=3\r\n");
    EXPECT_TRUE(WriteIni(disk_, name, "a", "Y", std::string("new")));
    EXPECT_EQ(read(name), "; head\r\n[A]\r\n x = 1 \r\nY=new\r\n\r\n[B]\r\nz=3\r\n");
}

TEST_F(Stores, WriteIni_NewKey_GoesToTheEndOfItsSection) {
    const std::string name = write("[A]\nx=1\n\n[B]\nz=3\n");
    EXPECT_TRUE(WriteIni(disk_, name, "A", "y", std::string("2")));
    EXPECT_EQ(read(name), "[A]\nx=1\ny=2\n\n[B]\nz=3\n");
}

TEST_F(Stores, WriteIni_EachType_IsWrittenAsItsText) {
    const std::string name = file("a.ini");
    EXPECT_TRUE(WriteIni(disk_, name, "A", "b", true));
    EXPECT_TRUE(WriteIni(disk_, name, "A", "c", false));
    EXPECT_TRUE(WriteIni(disk_, name, "A", "i", std::int16_t{-5}));
    EXPECT_TRUE(WriteIni(disk_, name, "A", "l", std::int32_t{100000}));
    EXPECT_TRUE(WriteIni(disk_, name, "A", "f", 0.1F));
    EXPECT_TRUE(WriteIni(disk_, name, "A", "d", 0.5));
    EXPECT_TRUE(WriteIni(disk_, name, "A", "t", std::string("a b")));
    EXPECT_EQ(read(name), "[A]\r\nb=1\r\nc=0\r\ni=-5\r\nl=100000\r\nf=0.1\r\nd=0.5\r\nt=a b\r\n");
}

TEST_F(Stores, WriteIni_ValueWithBlanksOrQuotes_ReadsBackAsItWas) {
    const std::string name = file("a.ini");
    for (const std::string text : {" a ", "\"q\"", "'", "", "a=b;c"}) {
        ASSERT_TRUE(WriteIni(disk_, name, "A", "x", text));
        EXPECT_EQ(textOf(ReadIni(disk_, name, "A", "x", std::string("none"))), text);
    }
}

TEST_F(Stores, WriteIni_LineEndInAValue_DoesNotBeginALine) {
    const std::string name = file("a.ini");
    ASSERT_TRUE(WriteIni(disk_, name, "A", "x", std::string("1\r\n[B]\r\ny=2")));
    EXPECT_EQ(textOf(ReadIni(disk_, name, "B", "y", std::string("none"))), "none");
}

TEST_F(Stores, WriteIni_FolderThatIsNotThere_FailsAndMakesNoFile) {
    EXPECT_FALSE(WriteIni(disk_, file("no/such/a.ini"), "A", "x", true));
    EXPECT_EQ(files(), 0U);
}

TEST_F(Stores, WriteIni_FileThatIsTooLarge_FailsAndLeavesIt) {
    const std::string large = "[A]\nx=1\n" + std::string((1U << 20) + 1, ';');
    const std::string name = write(large);
    EXPECT_FALSE(WriteIni(disk_, name, "A", "x", std::string("2")));
    EXPECT_EQ(read(name), large);
}

TEST_F(Stores, WriteIni_FileThatWouldGrowTooLarge_FailsAndLeavesIt) {
    const std::string name = write("[A]\nx=1\n");
    EXPECT_FALSE(WriteIni(disk_, name, "A", "y", std::string(1U << 20, 'a')));
    EXPECT_EQ(read(name), "[A]\nx=1\n");
}

TEST_F(Stores, WriteIni_FolderInPlaceOfTheFile_FailsAndLeavesNothingBeside) {
    disk_.putFolder(file("a.ini") + "/inner");
    EXPECT_FALSE(WriteIni(disk_, file("a.ini"), "A", "x", true));
    EXPECT_EQ(disk_.stat(file("a.ini")).kind, FileKind::Folder);
    EXPECT_EQ(files(), 1U);
}

TEST_F(Stores, Save_NameThatCannotBeReplaced_LeavesNothingBeside) {
    disk_.putFolder(file("a.ini") + "/inner");
    EXPECT_FALSE(IniFile::parse("[A]\nx=1\n").save(disk_, file("a.ini")));
    EXPECT_EQ(files(), 1U);
}

TEST_F(Stores, WriteIni_NameThatNoLineCanHold_FailsAndMakesNoFile) {
    for (const char* key : {"", " a", "a=b", ";a", "[a]", "a\nb", "\xB5"})
        EXPECT_FALSE(WriteIni(disk_, file("a.ini"), "A", key, true)) << key;
    for (const char* section : {"", "A ", "A]\r\n[B"})
        EXPECT_FALSE(WriteIni(disk_, file("a.ini"), section, "x", true)) << section;
    EXPECT_EQ(files(), 0U);
}

TEST_F(Stores, WriteIni_BytesThatAreNoUtf8_LeaveTheOtherTextsReadable) {
    const std::string name = write("[A]\nx=\xC2\xB5V\n");
    ASSERT_TRUE(WriteIni(disk_, name, "A", "y", std::string("\xB5s")));
    EXPECT_EQ(textOf(ReadIni(disk_, name, "A", "x", std::string())), "µV");
    EXPECT_EQ(textOf(ReadIni(disk_, name, "A", "y", std::string())), "µs");
}

TEST_F(Stores, WriteIni_RightsOfTheFile_Stay) {
    disk_.put(file("a.ini"), "[A]\nx=1\n", 0600);
    ASSERT_TRUE(WriteIni(disk_, file("a.ini"), "A", "x", std::string("2")));
    EXPECT_EQ(disk_.mode(file("a.ini")), 0600U);
}

TEST_F(Stores, WriteIni_FullDisk_FailsAndLeavesIt) {
    const std::string name = write("[A]\nx=1\n");
    disk_.room = 3;
    EXPECT_FALSE(WriteIni(disk_, name, "A", "x", std::string("2")));
    EXPECT_EQ(read(name), "[A]\nx=1\n");
}

TEST_F(Stores, WriteIni_FileThatCannotBeRead_FailsAndLeavesIt) {
    const std::string name = write("[A]\nx=1\n");
    disk_.readable = 4;
    EXPECT_EQ(textOf(ReadIni(disk_, name, "A", "x", std::string("none"))), "none");
    EXPECT_FALSE(WriteIni(disk_, name, "A", "x", std::string("2")));
    EXPECT_EQ(read(name), "[A]\nx=1\n");
}

TEST_F(Stores, WriteIni_WhatIsNoRegularFile_IsNotTouched) {
    disk_.putOther(file("pipe"));
    EXPECT_FALSE(WriteIni(disk_, file("pipe"), "A", "x", true));
    EXPECT_EQ(read(file("pipe")), "");
}

TEST_F(Stores, WriteIni_FileThatIsALink_ReplacesWhatItPointsTo) {
    const std::string name = write("[A]\nx=1\n");
    const std::string link = file("link.ini");
    disk_.putLink(link, name);
    ASSERT_TRUE(WriteIni(disk_, link, "A", "x", std::string("2")));
    EXPECT_EQ(read(link), "");  // still a link
    EXPECT_EQ(read(name), "[A]\nx=2\n");
}

class Registry : public Stores {
  protected:
    cRegistry registry() {
        cRegistry made(disk_, file("registry.ini"), [](const std::string& name) {
            return name == "HOME" ? std::string("/home/rf") : std::string();
        });
        made.SectionKey = "Software\\ZEL";
        return made;
    }
};

TEST_F(Registry, Value_ThatIsNotStored_IsTheDefault) {
    cRegistry keys = registry();
    keys.ValueKey = "Absent";
    keys.Default = "preset";
    EXPECT_EQ(keys.Value(), "preset");
    EXPECT_FALSE(keys.KeyExists());
}

TEST_F(Registry, Value_IsKeptWithItsType) {
    cRegistry keys = registry();
    keys.ValueKey = "Path";
    keys.ValueType = REG_EXPAND_SZ;
    keys.setValue("%HOME%/traces%");
    cRegistry later = registry();
    later.ValueKey = "Path";
    EXPECT_EQ(later.Value(), "/home/rf/traces%");
    EXPECT_EQ(later.ValueType, REG_EXPAND_SZ);
    EXPECT_TRUE(later.KeyExists());
}

TEST_F(Registry, PlainTextThatLooksLikeAnotherType_StaysPlain) {
    cRegistry keys = registry();
    keys.ValueKey = "Note";
    for (const std::string text : {"expand:%HOME%", "dword:1", "text:a", "plain"}) {
        keys.ValueType = REG_SZ;
        keys.setValue(text);
        EXPECT_EQ(keys.Value(), text);
        EXPECT_EQ(keys.ValueType, REG_SZ);
    }
}

TEST_F(Registry, Value_OfAPlainTextOrOfNone_HasThePlainType) {
    cRegistry keys = registry();
    keys.ValueKey = "Plain";
    keys.setValue("a");
    keys.ValueType = REG_EXPAND_SZ;
    EXPECT_EQ(keys.Value(), "a");
    EXPECT_EQ(keys.ValueType, REG_SZ);
    keys.ValueKey = "Absent";
    keys.ValueType = REG_DWORD;
    EXPECT_EQ(keys.Value(), "");
    EXPECT_EQ(keys.ValueType, REG_SZ);
}

TEST_F(Registry, KeyExists_WhereOnlyAKeyBelowWasMade_IsTrue) {
    cRegistry keys = registry();
    keys.SectionKey = "Software\\ZEL\\A";
    keys.CreateKey();
    keys.SectionKey = "SOFTWARE";
    EXPECT_TRUE(keys.KeyExists());
    keys.SectionKey = "Soft";
    EXPECT_FALSE(keys.KeyExists());
}

TEST_F(Registry, RootKeys_AreApart) {
    cRegistry keys = registry();
    keys.CreateKey();
    keys.ClassKey = HKEY_LOCAL_MACHINE;
    EXPECT_FALSE(keys.KeyExists());
}

TEST_F(Registry, CreateKey_ThatIsThere_KeepsItsValues) {
    cRegistry keys = registry();
    keys.ValueKey = "One";
    keys.setValue("1");
    keys.CreateKey();
    EXPECT_EQ(keys.Value(), "1");
}

TEST_F(Registry, EnumerateSections_GivesTheKeysDirectlyBelow) {
    cRegistry keys = registry();
    for (const char* section :
         {"Software\\ZEL\\A", "Software\\ZEL\\B\\C", "Software\\ZEL\\b\\D", "Software\\Other"}) {
        keys.SectionKey = section;
        keys.CreateKey();
    }
    keys.SectionKey = "software\\zel";
    std::vector<std::string> names;
    std::int32_t count = 0;
    EXPECT_TRUE(keys.EnumerateSections(names, count));
    EXPECT_EQ(names, (std::vector<std::string>{"A", "B"}));
    EXPECT_EQ(count, 2);
}

TEST_F(Registry, EnumerateValues_LeavesTheValueWithoutANameOut) {
    cRegistry keys = registry();
    keys.CreateKey();
    keys.ValueKey = "One";
    keys.setValue("1");
    std::vector<std::string> names;
    std::int32_t count = 0;
    EXPECT_TRUE(keys.EnumerateValues(names, count));
    EXPECT_EQ(names, std::vector<std::string>{"One"});
}

TEST_F(Registry, DeletedKeysAndValues_AreGone) {
    cRegistry keys = registry();
    keys.ValueKey = "One";
    keys.setValue("1");
    keys.DeleteValue();
    EXPECT_EQ(keys.Value(), "");
    keys.DeleteKey();
    EXPECT_FALSE(keys.KeyExists());
}

std::string failureOf(const std::function<void()>& operation) {
    try {
        operation();
    } catch (const RegistryError& error) {
        EXPECT_EQ(error.source, "ZELRemote.cRegistry");
        return error.what();
    }
    return "no failure";
}

TEST_F(Registry, Failures_SayWhatFailed) {
    cRegistry keys = registry();
    keys.ValueKey = "V";
    EXPECT_EQ(failureOf([&] { keys.DeleteKey(); }),
              "Failed to delete registry Key: '-2147483647',Section: 'Software\\ZEL'");
    EXPECT_EQ(failureOf([&] { keys.DeleteValue(); }),
              "Failed to open key '-2147483647',Section: 'Software\\ZEL' for delete access");
    keys.CreateKey();
    EXPECT_EQ(failureOf([&] { keys.DeleteValue(); }),
              "Failed to delete registry Key: '-2147483647',Section: 'Software\\ZEL',Key: 'V'");
    keys.ClassKey = 7;
    EXPECT_EQ(failureOf([&] { keys.CreateKey(); }),
              "Failed to create registry Key: 'Software\\ZEL'");
    EXPECT_EQ(failureOf([&] { keys.setValue("x"); }),
              "Failed to set registry value Key: '7',Section: 'Software\\ZEL',Key: 'V' to value: "
              "'x'");
}

TEST_F(Registry, CreateEXEAssociation_PointsFromTheEndingToTheCommand) {
    cRegistry keys = registry();
    keys.CreateEXEAssociation("/opt/zelremote", "ZEL.View", "Saved view", "zel", "&Open", true);
    const auto at = [&](const std::string& section) {
        return readRegistryText(registry(), HKEY_CURRENT_USER, "SOFTWARE\\Classes\\" + section, "",
                                "none");
    };
    EXPECT_EQ(at(".zel"), "ZEL.View");
    EXPECT_EQ(at("ZEL.View"), "Saved view");
    EXPECT_EQ(at("ZEL.View\\shell\\open"), "&Open");
    EXPECT_EQ(at("ZEL.View\\shell\\open\\command"), "\"/opt/zelremote\" \"%1\"");
    EXPECT_EQ(at("ZEL.View\\shell\\print"), "&Print");
    EXPECT_EQ(at("ZEL.View\\shell\\print\\command"), "\"/opt/zelremote\" /p \"%1\"");
    EXPECT_EQ(at("ZEL.View\\shell\\new"), "none");
    EXPECT_EQ(at("ZEL.View\\DefaultIcon"), "none");
}

TEST_F(Registry, CreateEXEAssociation_OnRequest_WritesAllVerbsAndTheIcon) {
    cRegistry keys = registry();
    keys.CreateEXEAssociation("/opt/zelremote", "ZEL.View", "Saved view", ".zel", "Show", false, "",
                              true, "Fresh", true, "Set up", 2);
    const auto at = [&](const std::string& section) {
        return readRegistryText(registry(), HKEY_CURRENT_USER, "SOFTWARE\\Classes\\" + section, "",
                                "none");
    };
    EXPECT_EQ(at(".zel"), "ZEL.View");
    EXPECT_EQ(at("ZEL.View\\shell\\open"), "Show");
    EXPECT_EQ(at("ZEL.View\\shell\\print"), "none");
    EXPECT_EQ(at("ZEL.View\\shell\\new"), "Fresh");
    EXPECT_EQ(at("ZEL.View\\shell\\install"), "Set up");
    EXPECT_EQ(at("ZEL.View\\DefaultIcon"), "/opt/zelremote,2");
}

TEST_F(Registry, CreateAdditionalEXEAssociations_WritesAVerbEach) {
    cRegistry keys = registry();
    keys.CreateAdditionalEXEAssociations("ZEL.View", {{"edit", "&Edit", "ed \"%1\""}});
    const auto at = [&](const std::string& section) {
        return readRegistryText(registry(), HKEY_CURRENT_USER, "SOFTWARE\\Classes\\" + section, "",
                                "none");
    };
    EXPECT_EQ(at("ZEL.View\\shell\\edit"), "&Edit");
    EXPECT_EQ(at("ZEL.View\\shell\\edit\\command"), "ed \"%1\"");
}

}  // namespace
}  // namespace zel
