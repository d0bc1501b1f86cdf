#pragma once
// The mirror of the instrument's settings, in the units and codes of the wire.

#include <array>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "model/UnsureSettings.h"
#include "platform/Form.h"

namespace zel {

/// A field is right only since the last exchange that touched it. Codes are those of CodeTables.
struct ZEL3Variables {
    std::int16_t InstrumentModel = 0;   ///< second field of IDN?
    double InstrumentSerial = 0;        ///< third field of IDN?
    std::uint8_t DynamicRangeMode = 0;  ///< DYNRANGE: 0 low distortion, else low noise
    bool ExternalTriggerActive = false;
    double Span = 0;                 ///< Hz; 0 is zero span
    double CenterFrequency = 0;      ///< Hz
    double FrequencyOffset = 0;      ///< Hz
    double ReferenceUnit = 0;        ///< UNIT code
    double ReferenceLevel = 0;       ///< in the reference unit
    double ReferenceRange = 0;       ///< RANGE code
    double SweepTime = 0;            ///< s
    std::uint8_t TraceDetector = 0;  ///< TRACEDET code
    double TriggerDelay = 0;         ///< s
    double TriggerLevelValue = 0;    ///< height of the trigger line, scale of the graph
    double ReferenceOffset = 0;      ///< dB
    double RFInputImpedance = 0;     ///< RFINPUT: 0 is 50 Ohm, 1 is 75 Ohm
    double ResolutionBandwidth = 0;  ///< RBW code, 0 is auto
    double VideoBandwidth = 0;       ///< VBW code, 0 is auto
    double SweepContinuous = 0;      ///< SWPCONT: 1 continuous, 0 single
    std::int16_t TriggerSource = 0;  ///< TRIGSRC code
    std::int16_t TraceMode = 0;      ///< TRACEMODE code
    std::int16_t ChannelPowerStandard = 0;
    double ChannelPowerValue = 0;
    std::int16_t ChannelPowerUnit = 0;
    double ChannelPowerBandwidth = 0;  ///< Hz
    std::int16_t OccBWStandard = 0;
    double OccBWValue = 0;             ///< Hz
    double OccBWChannelBandwidth = 0;  ///< Hz
    double OccBWValueCopy = 0;         ///< Hz
    std::int16_t TDMAStandard = 0;
    double TDMAMeasTime = 0;    ///< s
    double TDMAPowerValue = 0;  ///< dBm
    std::int16_t DTFMode = 0;
    double CableLength = 0;  ///< m
    std::string LengthUnit;
    bool PowerSensorExitRequested = false;
    std::string MarkerModeText;
    std::string MeasModeText;
    bool MarkerOn = false;
    bool DeltaOn = false;
    bool ScriptInProgress = false;
    bool ScanInProgress = false;          ///< a script scans frequencies
    std::int16_t CTraceAverageCount = 0;  ///< complex traces a measurement
    std::vector<double> CTraceData;       ///< 301 levels, 301 phases
    std::array<std::int16_t, 14> MenuVisitCount{};
    /// Where this record may differ from the instrument; no field of its own.
    UnsureSettings Unsure;

    /// Counts a visit of the menu with that word ("FREQ" to "DTF"). True from the second visit
    /// on: the mirror holds the menu's values. False for any other word.
    bool GetLazyQuery(std::string_view menuWord);
};

/// The fields by their names.
std::vector<Variable> variablesOf(const ZEL3Variables& mirror);

/// "dBm", "dBmV", "dBuV" for the codes 0, 1, 2 of the kind "CHNPWR", else empty.
std::string ChannelPowerUnitText(int code, std::string_view kind);

}  // namespace zel
