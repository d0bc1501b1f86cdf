// Typed entries: what the panel's parser gets, and what is refused with its reason.

#include <gtest/gtest.h>

#include "model/Numeric.h"
#include "panel/EntryText.h"

namespace zel {
namespace {

using U = EntryUnit;

struct Typed {
    const char* text;
    EntryUnit unit;
    const char* made;
    double value;
};
const Typed kRead[] = {
    {"2.4g", U::Hertz, "2.4 GHz", 2.4e9},
    {"2,4 GHz", U::Hertz, "2.4 GHz", 2.4e9},
    {"2.4 ghz", U::Hertz, "2.4 GHz", 2.4e9},
    {"900M", U::Hertz, "900 MHz", 900e6},
    {"900 mhz", U::Hertz, "900 MHz", 900e6},
    {"100000000 Hz", U::Hertz, "100 MHz", 1e8},
    {"100 000 000 Hz", U::Hertz, "100 MHz", 1e8},
    {"2400000001 Hz", U::Hertz, "2.400000001 GHz", 2400000001},
    {"999 Hz", U::Hertz, "999", 999},
    {"0 Hz", U::Hertz, "0", 0},
    {"-1500 Hz", U::Hertz, "-1.5 kHz", -1500},
    {"123456789.123456 Hz", U::Hertz, "123.456789123456 MHz", 123456789.123456},
    {"1,234,567.5", U::Hertz, "1234567.5", 1234567.5},
    {"-123,456.5", U::Level, "-123456.5", -123456.5},
    {"10 KHZ", U::Hertz, "10 kHz", 1e4},
    {"10k", U::Hertz, "10 kHz", 1e4},
    {"1.5e9", U::Hertz, "1.5e9", 1.5e9},
    {"0,500 GHz", U::Hertz, "0.500 GHz", 0.5e9},
    {",500G", U::Hertz, ".500 GHz", 0.5e9},
    {"1234,567M", U::Hertz, "1234.567 MHz", 1234.567e6},
    {",5G", U::Hertz, ".5 GHz", 0.5e9},
    {"+3", U::Hertz, "3", 3},
    {"-30 dBm", U::Level, "-30", -30},
    {"-30.50 dBm", U::Level, "-30.50", -30.5},  // the digits as they were typed
    {"50 %", U::Percent, "50", 50},
    {"007.0 s", U::WholeSeconds, "007.0", 7},
    {"- 30DBM", U::Level, "-30", -30},
    {"\u221230,5", U::Level, "-30.5", -30.5},
    {"3 dB", U::Decibels, "3", 3},
    {"2 s", U::Seconds, "2", 2},
    {"20 ms", U::Seconds, "20 ms", 0.02},
    {"20m", U::Seconds, "20 ms", 0.02},
    {"5 µs", U::Seconds, "5 us", 5e-6},
    {"5 us", U::Seconds, "5 us", 5e-6},
    {"5u", U::Seconds, "5 us", 5e-6},
    {"5 µ", U::Seconds, "5 us", 5e-6},
    {"5 μs", U::Seconds, "5 us", 5e-6},
    {"40 ns", U::Seconds, "40 ns", 40e-9},
    {"40n", U::Seconds, "40 ns", 40e-9},
    {"2 sec", U::Seconds, "2", 2},
    {"5 s", U::WholeSeconds, "5", 5},
    {"5 sec", U::WholeSeconds, "5", 5},
    {"12 m", U::Metres, "12", 12},
    {"1200 cm", U::Metres, "12", 12},
    {"12 mm", U::Metres, "0.012", 0.012},
    {"12 M", U::Metres, "12", 12},
    {"12 CM", U::Metres, "0.12", 0.12},
    {"2 KM", U::Metres, "2000", 2000},
    {"2 S", U::Seconds, "2", 2},
    {"2 SEC", U::Seconds, "2", 2},
    {"5 U", U::Seconds, "5 us", 5e-6},
    {"5 US", U::Seconds, "5 us", 5e-6},
    {"2 S", U::WholeSeconds, "2", 2},
    {"2 SEC", U::WholeSeconds, "2", 2},
    {"3 DB", U::Decibels, "3", 3},
    {"7 HZ", U::Hertz, "7", 7},
    {"7K", U::Hertz, "7 kHz", 7e3},
    {"7G", U::Hertz, "7 GHz", 7e9},
    {"7 MHZ", U::Hertz, "7 MHz", 7e6},
    {"7 Mhz", U::Hertz, "7 MHz", 7e6},
    {"1.2 km", U::Metres, "1200", 1200},
    {" 7 ", U::Enter, "7", 7},
};

TEST(EntryText, TypedEntry_IsWhatTheParserReads) {
    for (const Typed& row : kRead) {
        const EntryReading reading = readEntry(row.text, row.unit);
        ASSERT_TRUE(reading.ok) << row.text << ": " << reading.problem;
        EXPECT_EQ(reading.text, row.made) << row.text;
        EXPECT_DOUBLE_EQ(reading.value, row.value) << row.text;
        std::string prefix;
        EXPECT_NEAR(ParseValue(reading.text, prefix), row.value, std::abs(row.value) * 1e-12)
            << row.text;
    }
}

struct Refused {
    const char* text;
    EntryUnit unit;
    const char* part;  ///< of the reason
};
const Refused kRefused[] = {
    {"abc", U::Hertz, "is not a frequency"},
    {"", U::Hertz, "is not a frequency"},
    {"5 dBm", U::Hertz, "no unit of a frequency"},
    {"900m", U::Hertz, "thousandth"},
    {"1,500", U::Hertz, "1.500 or 1500"},
    {"123,456", U::Hertz, "123.456 or 123456"},
    {"1.500,5", U::Hertz, "only one"},
    {"1,2,3", U::Hertz, "only one"},
    {"1,234,56.7", U::Hertz, "only one"},
    {"1,23,456.7", U::Hertz, "only one"},
    {"1234,567.8", U::Hertz, "only one"},
    {"1,234.5,6", U::Hertz, "only one"},
    {"1.2.3", U::Hertz, "is not a frequency"},
    {"2.4 GHz x", U::Hertz, "no unit"},
    {"20 M", U::Seconds, "no unit of a time"},
    {"5 dBmV", U::Level, "no unit of a level"},
    {"5 dBm", U::Percent, "no unit of a height"},
    {"5 ms", U::WholeSeconds, "no unit of a time"},
    {"e9", U::Hertz, "is not a frequency"},
    {"-", U::Hertz, "\"-\" is not a frequency"},
    {"+", U::Level, "\"+\" is not a level"},
    {"- GHz", U::Hertz, "is not a frequency"},
    {"-x", U::Metres, "is not a length"},
    {"12 m", U::Enter, "no unit of a number"},
};

TEST(EntryText, EntryThatCannotBeRead_HasItsReason) {
    for (const Refused& row : kRefused) {
        const EntryReading reading = readEntry(row.text, row.unit);
        EXPECT_FALSE(reading.ok) << row.text << " became " << reading.text;
        EXPECT_NE(reading.problem.find(row.part), std::string::npos)
            << row.text << ": " << reading.problem;
    }
}

}  // namespace
}  // namespace zel
