#include <gtest/gtest.h>

#include <limits>

#include "support/JsonWriter.h"

namespace zel {
namespace {

TEST(JsonWriter, ListsAndObjects_HaveCommasBetweenTheirMembersOnly) {
    JsonWriter json;
    json.beginObject().member("a", 1).name("b").beginList().endList();
    json.name("c").beginList().beginObject().endObject().value(true).value(false).endList();
    json.member("d", "x").endObject();
    EXPECT_EQ(json.text(), R"({"a":1,"b":[],"c":[{},true,false],"d":"x"})");
}

TEST(JsonWriter, Numbers_HaveTheShortestDigitsThatReadBack) {
    JsonWriter json;
    json.values(std::vector<double>{0.1, -120, 1.0 / 3, 2.4e9, 1e300});
    EXPECT_EQ(json.text(), "[0.1,-120,0.3333333333333333,2.4e+09,1e+300]");
}

TEST(JsonWriter, WhatIsNoFiniteNumber_IsNullOrAText) {
    constexpr double kInfinity = std::numeric_limits<double>::infinity();
    JsonWriter json;
    json.values(
        std::vector<double>{std::numeric_limits<double>::quiet_NaN(), kInfinity, -kInfinity});
    EXPECT_EQ(json.text(), R"([null,"inf","-inf"])");
}

TEST(JsonWriter, Texts_AreQuoted) {
    JsonWriter json;
    json.value("a\"b\\c\n\x01 \xC2\xB5V");
    EXPECT_EQ(json.text(), "\"a\\\"b\\\\c\\u000a\\u0001 \xC2\xB5V\"");
}

TEST(JsonWriter, ATextThatIsNoUtf8_KeepsItsGoodCharacters) {
    JsonWriter json;
    json.value("a\xB5 b");
    EXPECT_EQ(json.text(), "\"a\xEF\xBF\xBD b\"");
}

}  // namespace
}  // namespace zel
