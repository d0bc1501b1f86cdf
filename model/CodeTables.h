#pragma once
// The instrument's code tables: what each code on the wire is called in the program, once.

#include <span>
#include <string>
#include <string_view>

namespace zel {

// Reference unit, UNIT.
inline constexpr int UNITDBM = 0;
inline constexpr int UNITDBMV = 1;
inline constexpr int UNITDBUV = 2;
inline constexpr int UNITDBUVM = 3;
inline constexpr int UNITDBUAM = 4;
inline constexpr int UNITDB = 5;
inline constexpr int UNITV = 6;
inline constexpr int UNITW = 7;
// Range, RANGE.
inline constexpr int RANGE10DB = 0;
inline constexpr int RANGE5DB = 1;
inline constexpr int RANGE2DB = 2;
inline constexpr int RANGE1DB = 3;
inline constexpr int RANGELIN = 4;
inline constexpr int RANGEVSWR6 = 5;
inline constexpr int RANGEVSWR2 = 6;
inline constexpr int RANGEVSWR15 = 7;
inline constexpr int RANGEVSWR11 = 8;
// Detector, TRACEDET.
inline constexpr int DETAUTOPEAK = 0;
inline constexpr int DETMINPEAK = 1;
inline constexpr int DETMAXPEAK = 2;
inline constexpr int DETSAMPLE = 3;
inline constexpr int DETRMS = 4;
// Trace mode, TRACEMODE.
inline constexpr int TRACECLEARWRITE = 0;
inline constexpr int TRACEAVERAGE = 1;
inline constexpr int TRACEMINHOLD = 2;
inline constexpr int TRACEMAXHOLD = 3;
inline constexpr int TRACEVIEW = 4;
// Trigger source, TRIGSRC.
inline constexpr int TRIGFREERUN = 0;
inline constexpr int TRIGVIDEO = 1;
inline constexpr int TRIGEXTRISE = 2;
inline constexpr int TRIGEXTFALL = 3;
// Standards, CHPWRSTD and OBWSTD; TDMASTD counts STDUSER and STDGSMEDGE.
inline constexpr int STDUSER = 0;
inline constexpr int STDWCDMA = 1;
inline constexpr int STDCDMAONE = 2;
inline constexpr int STDCDMA2000 = 3;
inline constexpr int STDGSMEDGE = 1;
// Distance to fault mode, DTFMODE.
inline constexpr int DTFMODEDTF = 0;
inline constexpr int DTFMODEREFLECTION = 1;
inline constexpr int DTFMODESPECTRUM = 2;

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
