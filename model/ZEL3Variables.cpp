#include "model/ZEL3Variables.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "model/CodeTables.h"
#include "platform/Form.h"

namespace zel {
namespace {

constexpr std::array<std::string_view, 14> kMenuWords = {
    "FREQ",   "SPAN",        "AMPT",  "BW",           "SWEEP",        "TRACE",     "MEAS",
    "MARKER", "TRACKINGGEN", "POWER", "CHANNELPOWER", "OCCBANDWIDTH", "TDMAPOWER", "DTF"};

}  // namespace

bool ZEL3Variables::GetLazyQuery(std::string_view menuWord) {
    const auto found = std::find(kMenuWords.begin(), kMenuWords.end(), menuWord);
    if (found == kMenuWords.end()) return false;
    std::int16_t& visits = MenuVisitCount.at(static_cast<std::size_t>(found - kMenuWords.begin()));
    if (visits < 2) ++visits;  // the count of a long session must not wrap
    return visits >= 2;
}

std::vector<Variable> variablesOf(const ZEL3Variables& mirror) {
    return {
        {"InstrumentModel", &mirror.InstrumentModel},
        {"InstrumentSerial", &mirror.InstrumentSerial},
        {"DynamicRangeMode", &mirror.DynamicRangeMode},
        {"ExternalTriggerActive", &mirror.ExternalTriggerActive},
        {"Span", &mirror.Span},
        {"CenterFrequency", &mirror.CenterFrequency},
        {"FrequencyOffset", &mirror.FrequencyOffset},
        {"ReferenceUnit", &mirror.ReferenceUnit},
        {"ReferenceLevel", &mirror.ReferenceLevel},
        {"ReferenceRange", &mirror.ReferenceRange},
        {"SweepTime", &mirror.SweepTime},
        {"TraceDetector", &mirror.TraceDetector},
        {"TriggerDelay", &mirror.TriggerDelay},
        {"TriggerLevelValue", &mirror.TriggerLevelValue},
        {"ReferenceOffset", &mirror.ReferenceOffset},
        {"RFInputImpedance", &mirror.RFInputImpedance},
        {"ResolutionBandwidth", &mirror.ResolutionBandwidth},
        {"VideoBandwidth", &mirror.VideoBandwidth},
        {"SweepContinuous", &mirror.SweepContinuous},
        {"TriggerSource", &mirror.TriggerSource},
        {"TraceMode", &mirror.TraceMode},
        {"ChannelPowerStandard", &mirror.ChannelPowerStandard},
        {"ChannelPowerValue", &mirror.ChannelPowerValue},
        {"ChannelPowerUnit", &mirror.ChannelPowerUnit},
        {"ChannelPowerBandwidth", &mirror.ChannelPowerBandwidth},
        {"OccBWStandard", &mirror.OccBWStandard},
        {"OccBWValue", &mirror.OccBWValue},
        {"OccBWChannelBandwidth", &mirror.OccBWChannelBandwidth},
        {"OccBWValueCopy", &mirror.OccBWValueCopy},
        {"TDMAStandard", &mirror.TDMAStandard},
        {"TDMAMeasTime", &mirror.TDMAMeasTime},
        {"TDMAPowerValue", &mirror.TDMAPowerValue},
        {"DTFMode", &mirror.DTFMode},
        {"CableLength", &mirror.CableLength},
        {"LengthUnit", &mirror.LengthUnit},
        {"ScriptInProgress", &mirror.ScriptInProgress},
        {"ScanInProgress", &mirror.ScanInProgress},
        {"CTraceAverageCount", &mirror.CTraceAverageCount},
        {"CTraceData", &mirror.CTraceData},
        {"PowerSensorExitRequested", &mirror.PowerSensorExitRequested},
        {"MarkerModeText", &mirror.MarkerModeText},
        {"MeasModeText", &mirror.MeasModeText},
        {"MarkerOn", &mirror.MarkerOn},
        {"DeltaOn", &mirror.DeltaOn},
    };
}

std::string ChannelPowerUnitText(int code, std::string_view kind) {
    if (kind != "CHNPWR") return "";
    const CodeRow* row = findCode(CodeTable::ChannelPowerUnit, code);
    return row == nullptr ? "" : std::string(row->text);
}

}  // namespace zel
