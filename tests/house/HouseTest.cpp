// The reader of the tables and the checks, on small trees that break the rules.

#include <gtest/gtest.h>

#include <stdexcept>
#include <string>
#include <vector>

#include "tests/house/House.h"

namespace zel::house {
namespace {

using Breaches = std::vector<std::string>;

const char* const kTables =
    "# The house\n"
    "## Allowed arrows\n\nWords.\n\n"
    "| room | may include | standard C++ only |\n"
    "| --- | --- | --- |\n"
    "| `low` | nothing | yes |\n"
    "| `low/deep` | `low` | yes |\n"
    "| `high` | `low` | no |\n"
    "| `tests` | everything | no |\n"
    "## Exceptions\n\n"
    "| file | includes | why |\n"
    "| --- | --- | --- |\n"
    "| `low/Odd.h` | `high/H.h` | until it moves |\n"
    "## The system and its clock\n\n"
    "| place | why |\n"
    "| --- | --- |\n"
    "| `low/Port` | the port |\n"
    "## The language of the user\n\n"
    "| place | why |\n"
    "| --- | --- |\n"
    "| `low/Date` | the date |\n";

SourceFile including(const std::string& path, const std::string& included) {
    return {path, "#include \"" + included + "\"\n"};
}

TEST(ReadHouse, Row_GivesNameArrowsAndKind) {
    const House house = readHouse(kTables);
    ASSERT_EQ(house.rooms.size(), 4u);
    EXPECT_EQ(house.rooms[2].name, "high");
    EXPECT_EQ(house.rooms[2].mayInclude, Breaches{"low"});
    EXPECT_FALSE(house.rooms[2].standardOnly);
    EXPECT_TRUE(house.rooms[0].standardOnly);
    EXPECT_FALSE(house.rooms[2].mayIncludeAll);
    EXPECT_TRUE(house.rooms[3].mayIncludeAll);
    ASSERT_EQ(house.exceptions.size(), 1u);
    EXPECT_EQ(house.exceptions[0].included, "high/H.h");
    EXPECT_EQ(house.systemPlaces, Breaches{"low/Port"});
    EXPECT_EQ(house.localePlaces, Breaches{"low/Date"});
}

TEST(ReadHouse, MissingTable_Throws) {
    EXPECT_THROW(readHouse("## Allowed arrows\n"), std::runtime_error);
}

TEST(ReadHouse, ArrowToNoRoom_Throws) {
    std::string tables = kTables;
    tables.replace(tables.find("| `low` | no |"), 14, "| `law` | no |");
    EXPECT_THROW(readHouse(tables), std::runtime_error);
}

TEST(RoomOf, PathInASubroom_GivesTheSubroom) {
    const House house = readHouse(kTables);
    EXPECT_EQ(house.roomOf("low/deep/A.h")->name, "low/deep");
    EXPECT_EQ(house.roomOf("low/deeper/A.h")->name, "low");
    EXPECT_EQ(house.roomOf("lower/A.h"), nullptr);
}

TEST(HomelessFiles, FileOutsideOfAllRooms_IsNamed) {
    EXPECT_EQ(homelessFiles(readHouse(kTables), {{"attic/A.h", ""}, {"low/A.h", ""}}),
              Breaches{"attic/A.h"});
}

TEST(MissingRooms, RoomWithoutAFile_IsNamed) {
    EXPECT_EQ(missingRooms(readHouse(kTables),
                           {{"low/A.h", ""}, {"low/deep/A.h", ""}, {"tests/low/T.cpp", ""}}),
              Breaches{"high has no file"});
}

TEST(MissingRooms, RoomMarkedAsComing_MayHaveNoFile) {
    std::string tables = kTables;
    tables.insert(tables.find("`high` | `low`") + 6, " (coming)");
    const std::vector<SourceFile> tree{{"low/A.h", ""}, {"low/deep/A.h", ""}, {"tests/T.cpp", ""}};
    EXPECT_EQ(missingRooms(readHouse(tables), tree), Breaches{});
}

TEST(MissingRooms, MarkOfARoomThatStands_IsNamed) {
    std::string tables = kTables;
    tables.insert(tables.find("`high` | `low`") + 6, " (coming)");
    EXPECT_EQ(missingRooms(
                  readHouse(tables),
                  {{"low/A.h", ""}, {"low/deep/A.h", ""}, {"high/H.h", ""}, {"tests/T.cpp", ""}}),
              Breaches{"high is not coming, it is there"});
}

TEST(UnmirroredRooms, RoomWithoutTests_IsNamed) {
    EXPECT_EQ(unmirroredRooms(readHouse(kTables), {{"tests/low/T.cpp", ""},
                                                   {"tests/house/T.cpp", ""},
                                                   {"tests/low/deep/T.cpp", ""}}),
              Breaches{"tests/high is missing"});
}

TEST(UnmirroredRooms, TestsOfNoRoom_AreNamed) {
    EXPECT_EQ(unmirroredRooms(readHouse(kTables), {{"tests/low/T.cpp", ""},
                                                   {"tests/low/deep/T.cpp", ""},
                                                   {"tests/high/T.cpp", ""},
                                                   {"tests/lower/T.cpp", ""},
                                                   {"tests/Session.h", ""}}),
              Breaches{"tests/lower mirrors no room"});
}

TEST(PictureBreaches, ArrowsOfTheTable_AreInOrder) {
    EXPECT_EQ(pictureBreaches(readHouse(kTables),
                              "<title>low/deep&#45;&gt;low</title><title>high&#45;&gt;low</title>"),
              Breaches{});
}

TEST(PictureBreaches, LongerWay_StandsForAnArrow) {
    std::string tables = kTables;
    tables.replace(tables.find("| `high` | `low` |"), 18, "| `high` | `low/deep`, `low` |");
    EXPECT_EQ(
        pictureBreaches(readHouse(tables),
                        "<title>low/deep&#45;&gt;low</title><title>high&#45;&gt;low/deep</title>"),
        Breaches{});
}

TEST(PictureBreaches, MissingArrowAndForeignArrow_AreNamed) {
    EXPECT_EQ(pictureBreaches(readHouse(kTables),
                              "<title>low&#45;&gt;high</title><title>low/deep&#45;&gt;low</title>"),
              (Breaches{"low -> high is not in the table", "high -> low is not in the picture"}));
}

TEST(UnknownIncludes, PathFromTheOwnFolder_IsNamed) {
    EXPECT_EQ(unknownIncludes({including("low/A.cpp", "A.h"), {"low/A.h", ""}}),
              Breaches{"low/A.cpp includes \"A.h\""});
}

TEST(UnknownIncludes, PathFromTheRootAndMadeFile_AreInOrder) {
    EXPECT_EQ(
        unknownIncludes(
            {including("low/A.cpp", "low/A.h"), including("low/B.cpp", "B.moc"), {"low/A.h", ""}}),
        Breaches{});
}

TEST(ForbiddenArrows, ArrowUp_IsNamed) {
    EXPECT_EQ(forbiddenArrows(readHouse(kTables), {including("low/A.h", "high/H.h")}),
              Breaches{"low/A.h includes \"high/H.h\": low may not include high"});
}

TEST(ForbiddenArrows, ArrowIntoASubroom_NeedsARowOfItsOwn) {
    EXPECT_EQ(forbiddenArrows(readHouse(kTables), {including("high/H.h", "low/deep/D.h")}).size(),
              1u);
}

TEST(ForbiddenArrows, AllowedArrowOwnRoomAndException_AreInOrder) {
    EXPECT_EQ(forbiddenArrows(readHouse(kTables), {including("high/H.h", "low/A.h"),
                                                   including("high/H.cpp", "high/H.h"),
                                                   including("low/Odd.h", "high/H.h"),
                                                   including("tests/low/T.cpp", "low/deep/D.h")}),
              Breaches{});
}

TEST(IdleExceptions, NoIncludeNeedsIt_IsNamed) {
    EXPECT_EQ(idleExceptions(readHouse(kTables), {including("low/Odd.h", "low/A.h")}),
              Breaches{"low/Odd.h -> high/H.h"});
}

TEST(IdleExceptions, IncludeNeedsIt_IsInOrder) {
    EXPECT_EQ(idleExceptions(readHouse(kTables), {including("low/Odd.h", "high/H.h")}), Breaches{});
}

TEST(CirclesOfIncludes, TwoRoomsThatIncludeEachOther_AreNamed) {
    EXPECT_EQ(circlesOfIncludes(readHouse(kTables), {including("low/Odd.h", "high/H.h"),
                                                     including("high/H.h", "low/A.h")}),
              Breaches{"high -> low -> high"});
}

TEST(CirclesOfTable, RowsThatAllowEachOther_AreNamed) {
    House house = readHouse(kTables);
    EXPECT_EQ(circlesOfTable(house), Breaches{});
    house.rooms[0].mayInclude = {"high"};
    EXPECT_EQ(circlesOfTable(house), Breaches{"high -> low -> high"});
}

class RealTimeWord : public ::testing::TestWithParam<const char*> {};

TEST_P(RealTimeWord, InCode_IsNamed) {
    const std::string text = std::string("void f() {\n    ") + GetParam() + ";\n}\n";
    const Breaches breaches = realTimeUses(readHouse(kTables), {{"low/A.cpp", text}});
    ASSERT_EQ(breaches.size(), 1u);
    EXPECT_EQ(breaches[0].rfind("low/A.cpp:2: ", 0), 0u);
}

TEST_P(RealTimeWord, InItsPlace_IsInOrder) {
    EXPECT_EQ(realTimeUses(readHouse(kTables), {{"low/PortA.cpp", GetParam()}}), Breaches{});
}

INSTANTIATE_TEST_SUITE_P(
    RealTimeUses, RealTimeWord,
    ::testing::Values("auto t = std::chrono::steady_clock::now()", "system_clock::now()",
                      "std::this_thread::sleep_for(ms)", "usleep(10)", "nanosleep(&t, nullptr)",
                      "QThread::msleep(5)", "QThread::sleep(5)", "QElapsedTimer timer",
                      "QTime::currentTime()", "QDateTime::currentMSecsSinceEpoch()",
                      "std::time(nullptr)", "::time(&t)", "x = time(nullptr)", "::sleep(1)",
                      "clock_gettime(CLOCK_MONOTONIC, &t)", "std::clock()"));

TEST(RealTimeUses, TimeOfTheProgramAndTalkOfClocks_AreInOrder) {
    const std::string text =
        "// steady_clock would be wrong here\n"
        "/* usleep(1) */ events.sleep(5); clock.now(); const char* t = \"usleep\";\n"
        "void VirtualEvents::sleep(int ms) {}\n";
    EXPECT_EQ(realTimeUses(readHouse(kTables), {{"low/A.cpp", text}}), Breaches{});
}

class LocaleWord : public ::testing::TestWithParam<const char*> {};

TEST_P(LocaleWord, InCode_IsNamed) {
    const std::string text = std::string("void f() {\n    ") + GetParam() + ";\n}\n";
    const Breaches breaches = localeUses(readHouse(kTables), {{"high/A.cpp", text}});
    ASSERT_EQ(breaches.size(), 1u);
    EXPECT_EQ(breaches[0].rfind("high/A.cpp:2: ", 0), 0u) << breaches[0];
}

TEST_P(LocaleWord, InItsPlaceOrInATest_IsInOrder) {
    const House house = readHouse(kTables);
    EXPECT_EQ(localeUses(house, {{"low/DateA.cpp", GetParam()}}), Breaches{});
    EXPECT_EQ(localeUses(house, {{"tests/low/A.cpp", GetParam()}}), Breaches{});
}

INSTANTIATE_TEST_SUITE_P(
    LocaleUses, LocaleWord,
    ::testing::Values(
        "std::printf(\"%f\", x)", "std::fprintf(file, \"%g\", x)", "std::sprintf(room, \"%e\", x)",
        "std::snprintf(room, sizeof room, \"%.*f\", 3, x)", "vsnprintf(room, 9, format, list)",
        "std::vfprintf(file, format, list)", "dprintf(1, \"%f\", x)", "asprintf(&text, \"%f\", x)",
        "swprintf(room, 9, L\"%f\", x)", "QString::asprintf(\"%f\", x)", "std::strtod(text, &end)",
        "strtof(text, &end)", "strtold(text, &end)", "std::strtol(text, &end, 10)",
        "std::strtoull(text, &end, 10)", "wcstod(text, &end)", "std::stod(text)", "std::stof(text)",
        "std::stold(text)", "std::stoi(text)", "std::stoul(text)", "std::stoll(text)",
        "std::atof(text)", "atoi(text)", "atoll(text)", "std::sscanf(text, \"%lf\", &x)",
        "fscanf(file, \"%lf\", &x)", "scanf(\"%lf\", &x)", "std::toupper(c)", "tolower(c)",
        "::toupper(c)", "std::transform(a, b, c, ::tolower)", "towupper(c)", "std::isspace(c)",
        "isdigit(c)", "std::isalpha(c)", "isalnum(c)", "isupper(c)", "islower(c)", "isprint(c)",
        "ispunct(c)", "iscntrl(c)", "isxdigit(c)", "isgraph(c)", "isblank(c)", "iswspace(c)",
        "strcasecmp(a, b)", "strncasecmp(a, b, n)", "std::strcoll(a, b)", "strxfrm(a, b, n)",
        "std::strftime(room, 9, \"%c\", &t)", "out << std::put_time(&t, \"%c\")",
        "in >> std::get_time(&t, \"%c\")", "std::setlocale(LC_ALL, \"\")", "localeconv()",
        "std::locale::global(l)", "std::locale l(\"\")", "out.imbue(std::locale(\"\"))",
        "std::ostringstream out", "std::istringstream in(text)", "std::stringstream both",
        "std::ifstream in(path)", "std::ofstream out(path)", "std::fstream both(path)",
        "QLocale().toString(x)", "QLocale::system().toDouble(text)", "QLocale locale",
        "a.localeAwareCompare(b)", "QCollator order"));

TEST(LocaleUses, OwnHelpersTalkAndClassicStreams_AreInOrder) {
    const std::string text =
        "// std::stod would ask the locale\n"
        "upperCase(text); QChar(c).isSpace(); isDigit(c); std::to_chars(a, b, x); x.toDouble();\n"
        "const char* word = \"printf\"; trace.printed(1); std::cout << text;\n"
        "std::ostringstream out;\nout.imbue(std::locale::classic());\n";
    EXPECT_EQ(localeUses(readHouse(kTables), {{"low/A.cpp", text}}), Breaches{});
}

TEST(ForeignHeaders, HeaderOfAToolkitOrTheSystem_IsNamed) {
    const SourceFile file{"low/A.cpp", "#include <QString>\n#include <unistd.h>\n#include <map>\n"};
    EXPECT_EQ(foreignHeaders(readHouse(kTables), {file}),
              (Breaches{"low/A.cpp includes <QString>", "low/A.cpp includes <unistd.h>"}));
}

TEST(ForeignHeaders, OtherRoomsAndPlacesOfTheSystem_AreFree) {
    EXPECT_EQ(foreignHeaders(readHouse(kTables), {{"high/A.cpp", "#include <QString>\n"},
                                                  {"low/Port.cpp", "#include <poll.h>\n"}}),
              Breaches{});
}

TEST(LongFiles, LineAboveTheLimit_IsNamed) {
    EXPECT_EQ(longFiles({{"low/A.h", "1\n2\n"}, {"low/B.h", "1\n2\n3\n"}}, 2),
              Breaches{"low/B.h: 3 lines"});
}

TEST(Includes, IncludeInAComment_DoesNotCount) {
    const SourceFile file{"low/A.h",
                          "// #include \"x/A.h\"\n/*\n#include \"x/B.h\"\n*/\n"
                          "#  include \"low/C.h\"  // \"x/D.h\"\n#include <map>\n"};
    EXPECT_EQ(includes(file, IncludeKind::Quoted), Breaches{"low/C.h"});
    EXPECT_EQ(includes(file, IncludeKind::Angled), Breaches{"map"});
}

TEST(CodeOnly, LiteralsAndComments_AreEmptied) {
    EXPECT_EQ(codeOnly("a(\"b\\\"c\", 'd', 1'000); // e\nf"), "a(\"\", '', 1'000);     \nf");
    EXPECT_EQ(codeOnly("x = R\"t(usleep\n\")t\"; y"), "x = R\"\n\"; y");
}

}  // namespace
}  // namespace zel::house
