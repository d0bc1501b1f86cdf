#include <gtest/gtest.h>

#include "model/MirrorField.h"

namespace zel {
namespace {

using ZV = ZEL3Variables;

TEST(MirrorFieldTest, Number_IsStoredAsTheFieldHoldsIt) {
    ZV mirror;
    storeField(mirror, &ZV::Span, 1.5, "text");
    EXPECT_EQ(mirror.Span, 1.5);
    storeField(mirror, &ZV::TraceMode, 2.6, "");
    EXPECT_EQ(mirror.TraceMode, 3);
    storeField(mirror, &ZV::TraceMode, 1e9, "");
    EXPECT_EQ(mirror.TraceMode, 32767);
    storeField(mirror, &ZV::TraceMode, -1e9, "");
    EXPECT_EQ(mirror.TraceMode, -32768);
    storeField(mirror, &ZV::TraceDetector, -1, "");
    EXPECT_EQ(mirror.TraceDetector, 0);
    storeField(mirror, &ZV::TraceDetector, 999, "");
    EXPECT_EQ(mirror.TraceDetector, 255);
}

TEST(MirrorFieldTest, TextField_TakesTheText) {
    ZV mirror;
    storeField(mirror, &ZV::LengthUnit, 5, "FEET");
    EXPECT_EQ(mirror.LengthUnit, "FEET");
    storeField(mirror, {}, 7, "nowhere");
    EXPECT_EQ(fieldNumber(mirror, {}), 0);
}

TEST(MirrorFieldTest, Field_IsReadAsANumber) {
    ZV mirror;
    mirror.Span = 2.5;
    mirror.TraceMode = -3;
    mirror.TraceDetector = 4;
    mirror.MeasModeText = "6 x";
    EXPECT_EQ(fieldNumber(mirror, &ZV::Span), 2.5);
    EXPECT_EQ(fieldNumber(mirror, &ZV::TraceMode), -3);
    EXPECT_EQ(fieldNumber(mirror, &ZV::TraceDetector), 4);
    EXPECT_EQ(fieldNumber(mirror, &ZV::MeasModeText), 6);
}

}  // namespace
}  // namespace zel
