#include "panel/MenuTables.h"

#include "forms/ControllerForm.h"

namespace zel {
namespace {

using CF = ControllerForm;
using T = CodeTable;
using K = PositionKind;

constexpr MenuPosition kNone{};

constexpr MenuPosition box(std::string_view frame, KeyAction key = KeyAction::Leave) {
    return {K::Box, frame, std::nullopt, key};
}

constexpr MenuPosition locked(std::string_view frame, KeyAction key = KeyAction::Leave) {
    return {K::LockedBox, frame, std::nullopt, key};
}

constexpr MenuPosition choice(std::string_view frame, CodeTable table) {
    return {K::Choice, frame, table};
}

constexpr MenuLayout kLayouts[] = {
    {CF::Freq,
     {{box("Frequency"), box("Span", KeyAction::Enable), box("Start Freq"), box("Stop Freq"),
       box("Freq Offset")}}},
    {CF::SPAN, {{box("Span"), kNone, kNone, kNone, kNone}}},
    // The list of the impedances above the box of position 3 is meant.
    {CF::AMPT,
     {{box("Ref Level"),
       choice("Range", T::Range),
       choice("Unit", T::ReferenceUnit),
       {K::Box, "Ref Level Offset", T::RFInput, KeyAction::Leave, true},
       choice("RF Input", T::RFInput)}}},
    {CF::BW,
     {{choice("Res Bandwidth", T::ResolutionBandwidth),
       locked("Value", KeyAction::PaintGreen),
       choice("Vid Bandwidth", T::VideoBandwidth),
       locked("Value", KeyAction::PaintGreen),
       {K::None, "", std::nullopt, KeyAction::Hide}}}},
    // The frame of position 3 keeps its earlier caption.
    {CF::SWEEP,
     {{box("Swp Time"),
       {K::LockedChoice, "Auto Swp", T::AutoSweepTime},
       choice("Swp Mode", T::SweepContinuous),
       choice("", T::TriggerSource),
       box("Lev/Del")}}},
    {CF::TRACE,
     {{choice("Trace Mode", T::TraceMode),
       choice("Detector", T::Detector),
       kNone,
       kNone,
       {K::HiddenBox}}}},
    {CF::Marker,
     {{box("Marker"),
       box("Delta"),
       choice("Mark Mode", T::MarkerMode),
       kNone,
       {K::None, "Mark RefLvl"}}}},
    {CF::MEAS,
     {{choice("Meas Mode", T::MeasurementMode),
       locked("Transducer"),
       locked("Limit Lines"),
       {K::None, "LmtCheck Stat", std::nullopt, KeyAction::Disable},
       kNone}}},
    {CF::TRACKINGGEN,
     {{locked("Transm Calibr"), locked("Refl Calibr"), locked("TrVector Calibr"),
       locked("TrReflVector Calibr"), locked("TrackingGen Lvl")}}},
    {CF::POWER,
     {{locked("Pwr Level"),
       box("Frequency", KeyAction::Enable),
       {K::None, "", std::nullopt, KeyAction::Disable},
       choice("Meas Time", T::PowerMeasTime),
       locked("Refl Lvl")}}},
    {CF::CHNPOWER,
     {{locked("Chn Power"), choice("ChnPwr Std", T::Standard),
       choice("ChnPwr Unit", T::ChannelPowerUnit), box("ChnPwr BW"), kNone}}},
    {CF::OCCBW,
     {{locked("Occ BW"), choice("Occ Bw Std", T::Standard), box("OccBw ChnBw"), kNone, kNone}}},
    {CF::TDMA,
     {{locked("TDMA Pwr"), choice("TDMA Standard", T::TDMAStandard), box("Meas Time"), kNone,
       kNone}}},
    {CF::DISTFAULT,
     {{box("Cable Model"), box("Cable Length"), choice("DTF Power", T::DTFMode), box("Unit Length"),
       kNone}}},
};

}  // namespace

const MenuLayout* menuLayout(std::int16_t state) {
    for (const MenuLayout& layout : kLayouts)
        if (layout.state == state) return &layout;
    return nullptr;
}

const std::array<HardKeyMenu, 8> kHardKeyMenus = {{
    {CF::Freq,
     {"CENTER\r\nFREQ", "MANUAL\r\nSPAN", "START\r\nFREQ", "STOP\r\nFREQ", "FREQ\r\nOFFSET"},
     "FREQ"},
    {CF::SPAN, {"MANUAL\r\nSPAN", "FULL\r\nSPAN", "ZERO\r\nSPAN", "LAST\r\nSPAN", ""}, "SPAN"},
    {CF::AMPT, {"REF\r\nLEVEL", "RANGE", "UNIT", "REF\r\nOFFSET", "RF INPUT"}, "AMPT"},
    {CF::BW,
     {"MANUAL\r\nRES BW", "AUTO\r\nRES  BW", "MANUAL\r\nVID BW", "AUTO\r\nVID BW", ""},
     "BW"},
    {CF::SWEEP,
     {"MANUAL\r\nSWPTIME", "AUTO\r\nSWPTIME", "SWEEP\r\nMODE", "TRIGGER", "TRIGGER\r\nDELAY"},
     "SWEEP"},
    {CF::TRACE, {"TRACE\r\nMODE", "DETECTOR", hiddenKey("TRACE"), "", ""}, "TRACE"},
    {CF::Marker, {"MARKER", "DELTA", "MARKER\r\nMODE", "", ""}, "MARKER"},
    {CF::MEAS, {"MEASURE", "TRANS\r\nDUCER", "LIMIT\r\nLINES", "DISPLAY\r\nLINE", ""}, "MEAS"},
}};

const HardKeyMenu* hardKeyMenu(std::int16_t state) {
    for (const HardKeyMenu& menu : kHardKeyMenus)
        if (menu.state == state) return &menu;
    return nullptr;
}

}  // namespace zel
