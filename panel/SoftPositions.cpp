#include "panel/SoftPositions.h"

#include <algorithm>
#include <cstdint>
#include <iterator>
#include <span>
#include <string>
#include <string_view>

#include "forms/ControllerForm.h"
#include "model/CodeTables.h"
#include "model/Numeric.h"
#include "model/ZEL3Variables.h"
#include "panel/MenuFill.h"
#include "support/NumberText.h"

namespace zel {
namespace {

using CF = ControllerForm;
using ZV = ZEL3Variables;
using T = CodeTable;
using K = PositionKind;
using S = EntrySource;
using U = EntryUnit;

std::string startText(const ZV& mirror, const MenuFill& /*fill*/) {
    return FormatValue(mirror.CenterFrequency - mirror.Span / 2, "Hz");
}
std::string stopText(const ZV& mirror, const MenuFill& /*fill*/) {
    return FormatValue(mirror.CenterFrequency + mirror.Span / 2, "Hz");
}
std::string channelPowerText(const ZV& mirror, const MenuFill& fill) {
    return FormatValue(mirror.ChannelPowerValue, fill.ChannelPowerUnitName);
}
/// The power's readout stands in the cable model's box.
std::string powerText(const ZV& /*mirror*/, const MenuFill& fill) {
    return FormatValue(leadingNumber(fill.LastPowerAnswer), "");
}
std::string lengthUnitText(const ZV& mirror, const MenuFill& /*fill*/) { return mirror.LengthUnit; }

bool hasOffset(const CF& panel, const ZV& /*mirror*/) {
    return panel.InstrumentMode != CF::TRACKINGGENERATOR;
}
bool measuresDistance(const CF& /*panel*/, const ZV& mirror) {
    return mirror.DTFMode == DTFMODEDTF;
}

// Five rows a menu. One value a line would hide the table in its columns.
// clang-format off
const SoftPosition kRows[] = {
    {.state = CF::Freq, .key = 0, .caption = "CENTER\r\nFREQ", .frame = "Frequency", .kind = K::Box,
     .word = "FREQ", .unit = "Hz", .field = &ZV::CenterFrequency, .source = S::Value,
     .onEntry = EntryQuirk::AfterCentre, .entryUnit = U::Hertz, .fill = Fill::Shows},
    {.state = CF::Freq, .key = 1, .caption = "MANUAL\r\nSPAN", .frame = "Span", .kind = K::Box,
     .action = KeyAction::Enable, .word = "SPAN", .unit = "Hz", .field = &ZV::Span,
     .onEntry = EntryQuirk::ManualSpan, .entryUnit = U::Hertz, .fill = Fill::Shows},
    {.state = CF::Freq, .key = 2, .caption = "START\r\nFREQ", .frame = "Start Freq", .kind = K::Box,
     .onKey = KeyQuirk::StartFrequency, .onEntry = EntryQuirk::StartFrequency,
     .entryUnit = U::Hertz, .fill = Fill::Shows, .fillText = startText},
    {.state = CF::Freq, .key = 3, .caption = "STOP\r\nFREQ", .frame = "Stop Freq", .kind = K::Box,
     .onKey = KeyQuirk::StopFrequency, .onEntry = EntryQuirk::StopFrequency, .entryUnit = U::Hertz,
     .fill = Fill::Shows, .fillText = stopText},
    {.state = CF::Freq, .key = 4, .caption = "FREQ\r\nOFFSET", .frame = "Freq Offset",
     .kind = K::Box, .word = "FREQOFFS", .unit = "Hz", .field = &ZV::FrequencyOffset,
     .source = S::Value, .onEntry = EntryQuirk::AfterOffset, .entryUnit = U::Hertz,
     .fill = Fill::Asks, .fillAsks = hasOffset},
    {.state = CF::SPAN, .key = 0, .caption = "MANUAL\r\nSPAN", .frame = "Span", .kind = K::Box,
     .word = "SPAN", .unit = "Hz", .field = &ZV::Span, .onEntry = EntryQuirk::ManualSpan,
     .entryUnit = U::Hertz, .fill = Fill::Shows},
    {.state = CF::SPAN, .key = 1, .caption = "FULL\r\nSPAN", .onKey = KeyQuirk::FullSpan,
     .entryUnit = U::Hertz},
    {.state = CF::SPAN, .key = 2, .caption = "ZERO\r\nSPAN", .onKey = KeyQuirk::ZeroSpan,
     .onEntry = EntryQuirk::ZeroSpan, .entryUnit = U::Hertz},
    {.state = CF::SPAN, .key = 3, .caption = "LAST\r\nSPAN", .onKey = KeyQuirk::LastSpan,
     .entryUnit = U::Hertz},
    {.state = CF::SPAN, .key = 4, .onKey = KeyQuirk::None, .entryUnit = U::Hertz},
    {.state = CF::AMPT, .key = 0, .caption = "REF\r\nLEVEL", .frame = "Ref Level", .kind = K::Box,
     .word = "REFLVL", .field = &ZV::ReferenceLevel, .onKey = KeyQuirk::ReferenceLevel,
     .source = S::Value, .entryUnit = U::Level, .fill = Fill::Shows, .fillUnit = "dBm"},
    {.state = CF::AMPT, .key = 1, .caption = "RANGE", .frame = "Range", .kind = K::Choice,
     .codes = T::Range, .word = "RANGE", .field = &ZV::ReferenceRange, .source = S::Choice,
     .fill = Fill::Shows},
    {.state = CF::AMPT, .key = 2, .caption = "UNIT", .frame = "Unit", .kind = K::Choice,
     .codes = T::ReferenceUnit, .word = "UNIT", .field = &ZV::ReferenceUnit, .source = S::Choice,
     .fill = Fill::Shows},
    // The list of the impedances above the box is meant.
    {.state = CF::AMPT, .key = 3, .caption = "REF\r\nOFFSET", .frame = "Ref Level Offset",
     .kind = K::Box, .listAboveBox = T::RFInput, .word = "REFLVLOFFS", .unit = "dB",
     .field = &ZV::ReferenceOffset, .source = S::Value, .entryUnit = U::Decibels,
     .fill = Fill::Asks},
    {.state = CF::AMPT, .key = 4, .caption = "RF INPUT", .frame = "RF Input", .kind = K::Choice,
     .codes = T::RFInput, .word = "RFINPUT", .field = &ZV::RFInputImpedance, .source = S::Choice,
     .fill = Fill::Asks},
    {.state = CF::BW, .key = 0, .caption = "MANUAL\r\nRES BW", .frame = "Res Bandwidth",
     .kind = K::Choice, .codes = T::ResolutionBandwidth, .word = "RBW", .unit = "Hz",
     .field = &ZV::ResolutionBandwidth, .onKey = KeyQuirk::Bandwidth, .source = S::Choice,
     .onEntry = EntryQuirk::AfterBandwidth, .fill = Fill::Asks},
    {.state = CF::BW, .key = 1, .caption = "AUTO\r\nRES  BW", .frame = "Value",
     .kind = K::LockedBox, .action = KeyAction::PaintGreen, .onKey = KeyQuirk::AutoBandwidth},
    {.state = CF::BW, .key = 2, .caption = "MANUAL\r\nVID BW", .frame = "Vid Bandwidth",
     .kind = K::Choice, .codes = T::VideoBandwidth, .word = "VBW", .unit = "Hz",
     .field = &ZV::VideoBandwidth, .onKey = KeyQuirk::Bandwidth, .source = S::Choice,
     .onEntry = EntryQuirk::AfterBandwidth, .fill = Fill::Asks},
    {.state = CF::BW, .key = 3, .caption = "AUTO\r\nVID BW", .frame = "Value", .kind = K::LockedBox,
     .action = KeyAction::PaintGreen, .onKey = KeyQuirk::AutoBandwidth},
    {.state = CF::BW, .key = 4, .action = KeyAction::Hide, .onKey = KeyQuirk::None},
    {.state = CF::SWEEP, .key = 0, .caption = "MANUAL\r\nSWPTIME", .frame = "Swp Time",
     .kind = K::Box, .word = "SWPTIME", .unit = "s", .field = &ZV::SweepTime, .source = S::Value,
     .onEntry = EntryQuirk::AfterSweepTime, .entryUnit = U::Seconds, .fill = Fill::Shows},
    {.state = CF::SWEEP, .key = 1, .caption = "AUTO\r\nSWPTIME", .frame = "Auto Swp",
     .kind = K::LockedChoice, .codes = T::AutoSweepTime, .onKey = KeyQuirk::AutoSweepTime,
     .onEntry = EntryQuirk::AutoSweepTime},
    {.state = CF::SWEEP, .key = 2, .caption = "SWEEP\r\nMODE", .frame = "Swp Mode",
     .kind = K::Choice, .codes = T::SweepContinuous, .word = "SWPCONT",
     .field = &ZV::SweepContinuous, .onEntry = EntryQuirk::SweepMode, .fill = Fill::Asks},
    // The frame keeps its earlier caption.
    {.state = CF::SWEEP, .key = 3, .caption = "TRIGGER", .kind = K::Choice,
     .codes = T::TriggerSource, .word = "TRIGSRC", .field = &ZV::TriggerSource,
     .onKey = KeyQuirk::TriggerSource, .onEntry = EntryQuirk::TriggerSource, .fill = Fill::Asks},
    {.state = CF::SWEEP, .key = 4, .caption = "TRIGGER\r\nDELAY", .frame = "Lev/Del",
     .kind = K::Box, .onKey = KeyQuirk::TriggerValue, .onEntry = EntryQuirk::TriggerValue,
     .entryUnit = U::TriggerValue},
    {.state = CF::TRACE, .key = 0, .caption = "TRACE\r\nMODE", .frame = "Trace Mode",
     .kind = K::Choice, .codes = T::TraceMode, .word = "TRACEMODE", .field = &ZV::TraceMode,
     .source = S::Choice, .fill = Fill::Asks},
    {.state = CF::TRACE, .key = 1, .caption = "DETECTOR", .frame = "Detector", .kind = K::Choice,
     .codes = T::Detector, .word = "TRACEDET", .field = &ZV::TraceDetector, .source = S::Choice,
     .fill = Fill::Shows},
    {.state = CF::TRACE, .key = 2, .caption = hiddenKey("TRACE"), .onKey = KeyQuirk::SingleTrace},
    {.state = CF::TRACE, .key = 3, .onKey = KeyQuirk::None},
    {.state = CF::TRACE, .key = 4, .kind = K::HiddenBox, .onKey = KeyQuirk::None},
    {.state = CF::Marker, .key = 0, .caption = "MARKER", .frame = "Marker", .kind = K::Box,
     .word = "MARK1", .unit = "Hz", .onKey = KeyQuirk::Marker, .onEntry = EntryQuirk::Marker,
     .entryUnit = U::MarkerX},
    {.state = CF::Marker, .key = 1, .caption = "DELTA", .frame = "Delta", .kind = K::Box,
     .word = "DELTA1", .unit = "Hz", .onKey = KeyQuirk::Marker, .onEntry = EntryQuirk::Marker,
     .entryUnit = U::MarkerX},
    {.state = CF::Marker, .key = 2, .caption = "MARKER\r\nMODE", .frame = "Mark Mode",
     .kind = K::Choice, .codes = T::MarkerMode, .word = "MARKMODE", .onKey = KeyQuirk::Marker,
     .source = S::Choice},
    {.state = CF::Marker, .key = 3, .onKey = KeyQuirk::None},
    {.state = CF::Marker, .key = 4, .frame = "Mark RefLvl", .onKey = KeyQuirk::None},
    {.state = CF::MEAS, .key = 0, .caption = "MEASURE", .frame = "Meas Mode", .kind = K::Choice,
     .codes = T::MeasurementMode, .word = "MEAS", .onEntry = EntryQuirk::MeasurementMode,
     .fill = Fill::Asks, .fillField = &ZV::MeasModeText},
    {.state = CF::MEAS, .key = 1, .caption = "TRANS\r\nDUCER", .frame = "Transducer",
     .kind = K::LockedBox, .onKey = KeyQuirk::TransducerMenu},
    {.state = CF::MEAS, .key = 2, .caption = "LIMIT\r\nLINES", .frame = "Limit Lines",
     .kind = K::LockedBox, .onKey = KeyQuirk::LimitMenu},
    {.state = CF::MEAS, .key = 3, .caption = "DISPLAY\r\nLINE", .frame = "LmtCheck Stat",
     .action = KeyAction::Disable, .onKey = KeyQuirk::None},
    {.state = CF::MEAS, .key = 4, .onKey = KeyQuirk::None},
    {.state = CF::MEAS_TRD, .key = 0, .caption = "TRANSD", .frame = "Transducer", .kind = K::Box,
     .word = "TRD1", .source = S::Text},
    {.state = CF::MEAS_TRD, .key = 1, .caption = "TRANSD\r\ndB", .frame = "Transducer Db",
     .kind = K::Box, .word = "TRD2", .source = S::Text},
    {.state = CF::MEAS_TRD, .key = 2, .caption = "TRANSD1\r\nOff",
     .onKey = KeyQuirk::TransducerOff},
    {.state = CF::MEAS_TRD, .key = 3, .caption = "TRANSD2\r\nOff",
     .onKey = KeyQuirk::TransducerOff},
    {.state = CF::MEAS_TRD, .key = 4, .caption = "EXIT", .onKey = KeyQuirk::LeaveSubMenu},
    {.state = CF::MEAS_LLINES, .key = 0, .caption = "LOWER\r\nLIMIT", .frame = "Lower Limit",
     .kind = K::Box, .word = "LIMLOW", .source = S::Text},
    {.state = CF::MEAS_LLINES, .key = 1, .caption = "UPPER\r\nLIMIT", .frame = "Upper Limit",
     .kind = K::Box, .word = "LIMUPP", .source = S::Text},
    {.state = CF::MEAS_LLINES, .key = 2, .caption = "LIMITS\r\nPASSED", .frame = "Limits Passed",
     .kind = K::LockedChoice, .codes = T::LimitPass, .word = "LIMPASS"},
    {.state = CF::MEAS_LLINES, .key = 3, .caption = "EXIT", .onKey = KeyQuirk::LeaveSubMenu},
    {.state = CF::MEAS_LLINES, .key = 4, .onKey = KeyQuirk::None},
    {.state = CF::TRACKINGGEN, .key = 0, .caption = "TRANS\r\nCAL", .frame = "Transm Calibr",
     .kind = K::LockedBox, .codes = T::Calibration, .word = "TRANSCAL"},
    {.state = CF::TRACKINGGEN, .key = 1, .caption = "REFLECT\r\nCAL", .frame = "Refl Calibr",
     .kind = K::LockedBox, .codes = T::Calibration, .word = "REFLCAL"},
    {.state = CF::TRACKINGGEN, .key = 2, .caption = "TRANSM\r\nVECT CAL",
     .frame = "TrVector Calibr", .kind = K::LockedBox, .codes = T::Calibration,
     .word = "TRANSVECTCAL"},
    {.state = CF::TRACKINGGEN, .key = 3, .caption = "REFLECT\r\nVECT CAL",
     .frame = "TrReflVector Calibr", .kind = K::LockedBox, .codes = T::Calibration,
     .word = "REFLVECTCAL"},
    {.state = CF::TRACKINGGEN, .key = 4, .caption = "TRACGEN\r\nLEVEL", .frame = "TrackingGen Lvl",
     .kind = K::LockedBox, .word = "TGLVL", .source = S::Whole},
    {.state = CF::POWER, .key = 0, .caption = "POWER", .frame = "Pwr Level", .kind = K::LockedBox,
     .word = "PWR", .unit = "dBm"},
    {.state = CF::POWER, .key = 1, .caption = "FREQ", .frame = "Frequency", .kind = K::Box,
     .action = KeyAction::Enable, .word = "FREQ", .unit = "Hz", .source = S::Value,
     .entryUnit = U::Hertz},
    {.state = CF::POWER, .key = 2, .caption = "POWER-\r\nREF", .action = KeyAction::Disable,
     .onKey = KeyQuirk::None},
    {.state = CF::POWER, .key = 3, .caption = "MEAS\r\nTIME", .frame = "Meas Time",
     .kind = K::Choice, .codes = T::PowerMeasTime, .word = "MEASTIME", .unit = "s",
     .source = S::Choice},
    {.state = CF::POWER, .key = 4, .caption = "REFL\r\nLEVEL", .frame = "Refl Lvl",
     .kind = K::LockedBox, .word = "REFL"},
    // The entries of positions 0 and 3 go out under the words of the standard and of the unit.
    {.state = CF::CHNPOWER, .key = 0, .caption = "CHN\r\nPOWER", .frame = "Chn Power",
     .kind = K::LockedBox, .word = "CHPWR", .field = &ZV::ChannelPowerValue,
     .onKey = KeyQuirk::ChannelPower, .source = S::Word, .setWord = "CHPWRSTD",
     .setField = MirrorField{}, .fill = Fill::Asks, .fillTurn = 2, .fillText = channelPowerText},
    {.state = CF::CHNPOWER, .key = 1, .caption = "CHN\r\nPWRSTD", .frame = "ChnPwr Std",
     .kind = K::Choice, .codes = T::Standard, .word = "CHPWRSTD",
     .field = &ZV::ChannelPowerStandard, .source = S::Choice, .fill = Fill::Asks, .fillTurn = 1},
    {.state = CF::CHNPOWER, .key = 2, .caption = "CHN\r\nPWRUNIT", .frame = "ChnPwr Unit",
     .kind = K::Choice, .codes = T::ChannelPowerUnit, .word = "CHPWRUNIT",
     .field = &ZV::ChannelPowerUnit, .onKey = KeyQuirk::ChannelPowerUnit, .source = S::Choice,
     .fill = Fill::Asks, .fillTurn = 3},
    {.state = CF::CHNPOWER, .key = 3, .caption = "CHN\r\nPWRBW", .frame = "ChnPwr BW",
     .kind = K::Box, .word = "CHPWRBW", .unit = "Hz", .field = &ZV::ChannelPowerBandwidth,
     .source = S::Word, .setWord = "CHPWRUNIT", .setField = MirrorField{}, .fill = Fill::Asks,
     .fillTurn = 4},
    {.state = CF::CHNPOWER, .key = 4, .caption = "LEVEL\r\nADJ", .word = "LVLADJUST",
     .onKey = KeyQuirk::LevelAdjust},
    {.state = CF::OCCBW, .key = 0, .caption = "OCCUP\r\nBW", .frame = "Occ BW",
     .kind = K::LockedBox, .word = "OBW", .unit = "Hz", .field = &ZV::OccBWValue,
     .leadingNumber = true, .fill = Fill::Asks, .fillTurn = 2},
    {.state = CF::OCCBW, .key = 1, .caption = "OCCBW\r\nSTD", .frame = "Occ Bw Std",
     .kind = K::Choice, .codes = T::Standard, .word = "OBWSTD", .field = &ZV::OccBWStandard,
     .source = S::Choice, .fill = Fill::Asks, .fillTurn = 1},
    // The key's answer lands in the channel power's field.
    {.state = CF::OCCBW, .key = 2, .caption = "OCCBW\r\nCHNBW", .frame = "OccBw ChnBw",
     .kind = K::Box, .word = "OBWCHBW", .unit = "Hz", .field = &ZV::ChannelPowerBandwidth,
     .source = S::Whole, .setField = &ZV::OccBWChannelBandwidth, .entryUnit = U::Hertz,
     .fill = Fill::Asks, .fillField = &ZV::OccBWChannelBandwidth, .fillTurn = 3},
    {.state = CF::OCCBW, .key = 3, .caption = "LVL\r\nADJ", .word = "LVLADJUST",
     .onKey = KeyQuirk::LevelAdjust},
    {.state = CF::OCCBW, .key = 4, .caption = hiddenKey("LEVEL\r\nADJ"), .onKey = KeyQuirk::None},
    {.state = CF::TDMA, .key = 0, .caption = "TDMA\r\nPOWER", .frame = "TDMA Pwr",
     .kind = K::LockedBox, .word = "TDMAPWR", .unit = "dBm", .field = &ZV::TDMAPowerValue,
     .fill = Fill::Asks, .fillTurn = 3},
    {.state = CF::TDMA, .key = 1, .caption = "TDMA\r\nPWRSTD", .frame = "TDMA Standard",
     .kind = K::Choice, .codes = T::TDMAStandard, .word = "TDMASTD", .field = &ZV::TDMAStandard,
     .source = S::Choice, .fill = Fill::Asks, .fillTurn = 1},
    {.state = CF::TDMA, .key = 2, .caption = "MEAS\r\nTIME", .frame = "Meas Time", .kind = K::Box,
     .word = "MEASTIME", .unit = "s", .field = &ZV::TDMAMeasTime, .source = S::Whole,
     .entryUnit = U::WholeSeconds, .fill = Fill::Asks, .fillTurn = 2},
    {.state = CF::TDMA, .key = 3, .caption = "LVL\r\nADJ", .word = "LVLADJUST",
     .onKey = KeyQuirk::LevelAdjust},
    {.state = CF::TDMA, .key = 4, .caption = hiddenKey("LEVEL\r\nADJ"), .onKey = KeyQuirk::None},
    {.state = CF::DISTFAULT, .key = 0, .caption = "CABLE\r\nMODEL", .frame = "Cable Model",
     .kind = K::Box, .word = "CABLEMOD", .source = S::Text, .fill = Fill::Shows,
     .fillText = powerText},
    {.state = CF::DISTFAULT, .key = 1, .caption = "CABLE\r\nLEN", .frame = "Cable Length",
     .kind = K::Box, .word = "CABLELEN", .field = &ZV::CableLength, .source = S::LocaleValue,
     .entryUnit = U::Metres, .fill = Fill::Asks, .fillTurn = 2, .fillUnit = "m",
     .fillAsks = measuresDistance},
    {.state = CF::DISTFAULT, .key = 2, .caption = "DTF\r\nMODE", .frame = "DTF Power",
     .kind = K::Choice, .codes = T::DTFMode, .word = "DTFMODE", .field = &ZV::DTFMode,
     .source = S::Choice, .fill = Fill::Asks, .fillTurn = 1},
    {.state = CF::DISTFAULT, .key = 3, .caption = "LEN\r\nUNIT", .frame = "Unit Length",
     .kind = K::Box, .word = "LENUNIT", .field = &ZV::LengthUnit, .source = S::Text,
     .fill = Fill::Shows, .fillText = lengthUnitText},
    {.state = CF::DISTFAULT, .key = 4, .caption = hiddenKey("LEVEL\r\nADJ"),
     .onKey = KeyQuirk::None},
};
// clang-format on

struct MenuRow {
    std::int16_t state;
    std::string_view word;
};
constexpr MenuRow kMenus[] = {
    {CF::AMPT, "AMPT"},
    {CF::SPAN, "SPAN"},
    {CF::Freq, "FREQ"},
    {CF::BW, "BW"},
    {CF::SWEEP, "SWEEP"},
    {CF::TRACE, "TRACE"},
    {CF::MEAS, "MEAS"},
    {CF::Marker, "MARKER"},
    {CF::CHNPOWER, "CHANNELPOWER"},
    {CF::OCCBW, "OCCBANDWIDTH"},
    {CF::TDMA, "TDMAPOWER"},
    {CF::DISTFAULT, "DTF"},
};

}  // namespace

std::span<const SoftPosition> softPositions() { return kRows; }

std::span<const SoftPosition> softPositions(std::int16_t state) {
    const auto* first = std::find_if(std::begin(kRows), std::end(kRows),
                                     [&](const SoftPosition& row) { return row.state == state; });
    const auto* last = std::find_if(first, std::end(kRows),
                                    [&](const SoftPosition& row) { return row.state != state; });
    return {first, last};
}

const SoftPosition* softPosition(std::int16_t state, int key) {
    for (const SoftPosition& row : softPositions(state))
        if (row.key == key) return &row;
    return nullptr;
}

std::string_view menuWord(std::int16_t state) {
    for (const MenuRow& row : kMenus)
        if (row.state == state) return row.word;
    return {};
}

std::int16_t menuOf(std::string_view word) {
    for (const MenuRow& row : kMenus)
        if (row.word == word) return row.state;
    return 0;
}

}  // namespace zel
