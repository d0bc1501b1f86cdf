#pragma once
// The instrument's code tables: what each code on the wire is called in the program, once.

#include <compare>
#include <cstdint>
#include <span>
#include <string>
#include <string_view>
#include <type_traits>

namespace zel {

// The codes are numbers on the wire and in the mirror, where one may be none of these; so they
// compare with any number and convert to one, but no number becomes a code by itself.

/// UNIT: the reference unit.
enum UnitCode : std::uint8_t {
    UNITDBM = 0,
    UNITDBMV = 1,
    UNITDBUV = 2,
    UNITDBUVM = 3,
    UNITDBUAM = 4,
    UNITDB = 5,
    UNITV = 6,
    UNITW = 7,
};
/// RANGE: decibels a division, or a linear range.
enum RangeCode : std::uint8_t {
    RANGE10DB = 0,
    RANGE5DB = 1,
    RANGE2DB = 2,
    RANGE1DB = 3,
    RANGELIN = 4,
    RANGEVSWR6 = 5,
    RANGEVSWR2 = 6,
    RANGEVSWR15 = 7,
    RANGEVSWR11 = 8,
};
/// TRACEDET.
enum DetectorCode : std::uint8_t {
    DETAUTOPEAK = 0,
    DETMINPEAK = 1,
    DETMAXPEAK = 2,
    DETSAMPLE = 3,
    DETRMS = 4,
};
/// TRACEMODE.
enum TraceModeCode : std::uint8_t {
    TRACECLEARWRITE = 0,
    TRACEAVERAGE = 1,
    TRACEMINHOLD = 2,
    TRACEMAXHOLD = 3,
    TRACEVIEW = 4,
};
/// TRIGSRC.
enum TriggerCode : std::uint8_t {
    TRIGFREERUN = 0,
    TRIGVIDEO = 1,
    TRIGEXTRISE = 2,
    TRIGEXTFALL = 3,
};
/// CHPWRSTD and OBWSTD.
enum StandardCode : std::uint8_t {
    STDUSER = 0,
    STDWCDMA = 1,
    STDCDMAONE = 2,
    STDCDMA2000 = 3,
};
/// TDMASTD; 0 is STDUSER.
enum TdmaStandardCode : std::uint8_t { STDGSMEDGE = 1 };
/// DTFMODE.
enum DtfModeCode : std::uint8_t {
    DTFMODEDTF = 0,
    DTFMODEREFLECTION = 1,
    DTFMODESPECTRUM = 2,
};

template <class T>
concept WireCode = std::is_same_v<T, UnitCode> || std::is_same_v<T, RangeCode> ||
    std::is_same_v<T, DetectorCode> || std::is_same_v<T, TraceModeCode> ||
    std::is_same_v<T, TriggerCode> || std::is_same_v<T, StandardCode> ||
    std::is_same_v<T, TdmaStandardCode> || std::is_same_v<T, DtfModeCode>;

template <class Number, WireCode Code>
requires std::is_arithmetic_v<Number>
constexpr bool operator==(Number number, Code code) {
    return static_cast<double>(number) == static_cast<double>(code);
}

template <class Number, WireCode Code>
requires std::is_arithmetic_v<Number>
constexpr std::partial_ordering operator<=>(Number number, Code code) {
    return static_cast<double>(number) <=> static_cast<double>(code);
}

/// One code: the caption that a query writes (the code and ")" follow it), the entry of a choice
/// list (empty: not offered), a further text (unit, soft key caption), a number (hertz of a
/// bandwidth, dB a division of a range) and the word in a saved view (empty: no line).
struct CodeRow {
    int code;
    std::string_view caption;
    std::string_view choice;
    std::string_view text = {};
    double number = 0;
    std::string_view saved = {};
};

enum class CodeTable {
    ReferenceUnit,        ///< text: the unit of the reference level
    Range,                ///< number: dB a division, 10 for the linear ranges
    ResolutionBandwidth,  ///< number: Hz, 0 for auto
    VideoBandwidth,       ///< number: Hz, 0 for auto
    Detector,
    TraceMode,
    TriggerSource,  ///< text: caption of soft key 4
    Standard,       ///< of channel power and occupied bandwidth
    TDMAStandard,
    ChannelPowerUnit,  ///< text: unit
    DTFMode,
    MeasurementMode,  ///< text: caption of the graph's mode
    RFInput,
    SweepContinuous,
    MarkerMode,
    LimitPass,
    Calibration,
    PowerMeasTime,
    AutoSweepTime,
};

std::span<const CodeRow> codeTable(CodeTable table);
/// The row of that code, or null.
const CodeRow* findCode(CodeTable table, double code);
/// The unit of the reference level; "dBm" for a code that is none.
std::string levelUnitText(double unitCode);
/// dB a division: 10, 5, 2, 1 for the range codes 0 to 3 and 10 for any other.
double decibelsPerDivision(double rangeCode);
/// "200 kHz (10)": caption, code and bracket; empty for a code that is none.
std::string codeCaption(CodeTable table, double code);

}  // namespace zel
