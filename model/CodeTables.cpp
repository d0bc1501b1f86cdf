#include "model/CodeTables.h"

#include <cmath>
#include <span>
#include <string>

namespace zel {
namespace {

// Misspelt and swapped captions in these tables are what the instrument's users know; they are
// meant.

constexpr CodeRow kReferenceUnit[] = {
    {0, "dBm (", "dBm", "dBm", 0, "dBm"},
    {1, "dBmV (", "dBmV", "dBmV", 0, "dBmV"},
    {2, "dBmuV (", "dBµV", "dBµV", 0, "dBuV"},
    {3, "dBmuV/m (", "dBµV/m", "dBµV/m", 0, "dBuV/m"},
    {4, "dBmuA/m (", "dBµA/m", "dBµA/m", 0, "dBuA/m"},
    {5, "dB (", "dB", "dB", 0, "dB"},
    {6, "Volt (", "Volt", "V", 0, "V"},
    {7, "Watt (", "Watt", "W", 0, "W"},
    {8, "V/m (", "", "dBm"},
};

constexpr CodeRow kRange[] = {
    {0, "10dB/DIV (", "10dB/DIV", "", 10, "10 dB/div"},
    {1, "5dB/DIV (", "5dB/DIV", "", 5, "5 dB/div"},
    {2, "2dB/DIV (", "2dB/DIV", "", 2, "2 dB/div"},
    {3, "1dB/DIV (", "1dB/DIV", "", 1, "1 dB/div"},
    {4, "LIN 0-100% (", "LIN 0-100%", "", 10, "lin 0 - 100%"},
    {5, "VSWR 1-6 (", "VSWR 1-6", "", 10, "TODO"},
    {6, "VSWR 1-2 (", "VSWR 1-2", "", 10, "TODO"},
    {7, "VSWR 1-1,5 (", "", "", 10, "TODO"},
    {8, "VSWR 1-1,1 (", "", "", 10, "TODO"},
};

constexpr CodeRow kResolutionBandwidth[] = {
    {0, "Auto (", "Auto"},
    {1, "100 Hz (", "100 Hz", "", 100},
    {2, "300 Hz (", "300 Hz", "", 300},
    {3, "1 kHz (", "1 kHz", "", 1000},
    {4, "3 kHz (", "3 kHz", "", 3000},
    {5, "10 kHz (", "10 kHz", "", 10000},
    {6, "30 kHz (", "30 kHz", "", 30000},
    {7, "100 kHz (", "100 kHz", "", 100000},
    {8, "300 kHz (", "300 kHz", "", 300000},
    {9, "1 MHz (", "1 MHz", "", 1000000},
    {10, "200 kHz (", "", "", 200000},
};

constexpr CodeRow kVideoBandwidth[] = {
    {0, "Auto (", "Auto"},
    {1, "10 Hz (", "10 Hz", "", 10},
    {2, "30 Hz (", "30 Hz", "", 30},
    {3, "100 Hz (", "100 Hz", "", 100},
    {4, "300 Hz (", "300 Hz", "", 300},
    {5, "1 kHz (", "1 kHz", "", 1000},
    {6, "3 kHz (", "3 kHz", "", 3000},
    {7, "10 kHz (", "10 kHz", "", 10000},
    {8, "30 kHz (", "30 kHz", "", 30000},
    {9, "100 kHz (", "100 kHz", "", 100000},
    {10, "300 kHz (", "300 kHz", "", 300000},
    {11, "1 MHz (", "1 MHz", "", 1000000},
    {12, "3 MkHz (", "3 MHz", "", 3000000},
};

constexpr CodeRow kDetector[] = {
    {0, "Auto Peak (", "Auto Peak", "", 0, "Auto Peak (Auto)"},
    {1, "Min Peak (", "Min Peak", "", 0, "Min Peak"},
    {2, "Max Peak (", "Max Peak", "", 0, "Max Peak"},
    {3, "Sample (", "Sample", "", 0, "Sample"},
    {4, "RMS (", "RMS", "", 0, "RMS"},
};

constexpr CodeRow kTraceMode[] = {
    {0, "Clear Write (", "Clear Write", "", 0, "Clear / Write"},
    {1, "Average (", "Average", "", 0, "Average"},
    {2, "Max Hold (", "Max Hold", "", 0, "Min Hold"},
    {3, "Min Hold (", "Min Hold", "", 0, "Max Hold"},
    {4, "View (", "View", "", 0, "View"},
};

constexpr CodeRow kTriggerSource[] = {
    {0, "Free Run (", "Free Run", "TRIGGER\r\nDELAY", 0, "Free Run"},
    {1, "Video (", "Video", "TRIGGER\r\nLEVEL", 0, "Video"},
    {2, "Ext - Rise (", "Ext - Rise", "TRIGGER\r\nDELAY", 0, "Ext Rise"},
    {3, "Ext - Fall (", "Ext - Fall", "TRIGGER\r\nDELAY", 0, "Ext Fall"},
    {4, "", "Delay", "TRIGGER\r\nDELAY"},
};

constexpr CodeRow kStandard[] = {
    {0, "User (", "User", "", 0, "USER"},
    {1, "3GPP WCDMA (", "3GPP WCDMA", "", 0, "3GPP WCDMA"},
    {2, "cdmaOne (", "cmdaOne", "", 0, "cdmaOne"},
    {3, "cdma2000 1x (", "cdma2000 1x", "", 0, "cdma2000 1x"},
};

constexpr CodeRow kTDMAStandard[] = {
    {0, "User (", "User", "", 0, "TDMA PWR USER"},
    {1, "GSM/EDGE (", "GSM/EDGE", "", 0, "GSM EDGE"},
};

constexpr CodeRow kChannelPowerUnit[] = {
    {0, "dBm (", "dBm", "dBm"},
    {1, "dBmV (", "dBmV", "dBmV"},
    {2, "dBmuV (", "dBµV", "dBuV"},
};

constexpr CodeRow kDTFMode[] = {
    {0, "DTF (", "DTF", "", 0, "DTF"},
    {1, "Reflection (", "Reflection", "", 0, "DTF Reflection"},
    {2, "Spectrum (", "Spectrum", "", 0, "DTF Spectrum"},
};

constexpr CodeRow kMeasurementMode[] = {
    {0, "Off (", "Off", ""},
    {1, "Analyzer (", "Analyzer", "Analyzer", 0, "Analyzer"},
    {2, "Tracking Generator (", "Tracking Gen", "Tracking Generator", 0, "Tracking Gen"},
    {3, "Power Sensor (", "Pwr Sensor", "Power Sensor", 0, "Power Sensor"},
    {4, "Channel Power (", "Chn Power", "Channel Power", 0, "Channel Power"},
    {5, "Occupied Bandwidth (", "Occ Bandwidth", "Occupied Bandwidth", 0, "Occupied Bandwidth"},
    {6, "TDMA Power (", "TDMA Pwr", "TDMA Power", 0, "TDMA Power"},
    {7, "Distance To Fault (", "Dist to Fault", "Distance To Fault", 0, "Fault Location"},
    {8, "VSWR 1-1,1 (", "Receiver", "Receiver", 0,
     "Receiver"},  // caption of the range table's code 8
};

constexpr CodeRow kRFInput[] = {{0, "50 Ohm (", "50 Ohm"}, {1, "75 Ohm (", "75 Ohm"}};

constexpr CodeRow kSweepContinuous[] = {{0, "Single", "Single"}, {1, "Continuous", "Continuous"}};

constexpr CodeRow kMarkerMode[] = {
    {0, "Normal (", "Normal"},
    {1, "Noise (", "Noise"},
    {2, "ControllerForm.FREQ Count (", "Freq Count"},
};

constexpr CodeRow kLimitPass[] = {
    {0, "Unknown (", "Unknown"}, {1, "Failed (", "Failed"}, {2, "Passed (", "Passed"}};

constexpr CodeRow kCalibration[] = {{0, "Not calibrated (", ""}, {1, "Calibrated (", ""}};

constexpr CodeRow kPowerMeasTime[] = {
    {0, "Short (", "Short"}, {1, "Normal (", "Normal"}, {2, "Long (", "Long"}};

constexpr CodeRow kAutoSweepTime[] = {{0, "On", "On"}, {1, "Off", "Off"}};

}  // namespace

std::span<const CodeRow> codeTable(CodeTable table) {
    switch (table) {
        case CodeTable::ReferenceUnit:
            return kReferenceUnit;
        case CodeTable::Range:
            return kRange;
        case CodeTable::ResolutionBandwidth:
            return kResolutionBandwidth;
        case CodeTable::VideoBandwidth:
            return kVideoBandwidth;
        case CodeTable::Detector:
            return kDetector;
        case CodeTable::TraceMode:
            return kTraceMode;
        case CodeTable::TriggerSource:
            return kTriggerSource;
        case CodeTable::Standard:
            return kStandard;
        case CodeTable::TDMAStandard:
            return kTDMAStandard;
        case CodeTable::ChannelPowerUnit:
            return kChannelPowerUnit;
        case CodeTable::DTFMode:
            return kDTFMode;
        case CodeTable::MeasurementMode:
            return kMeasurementMode;
        case CodeTable::RFInput:
            return kRFInput;
        case CodeTable::SweepContinuous:
            return kSweepContinuous;
        case CodeTable::MarkerMode:
            return kMarkerMode;
        case CodeTable::LimitPass:
            return kLimitPass;
        case CodeTable::Calibration:
            return kCalibration;
        case CodeTable::PowerMeasTime:
            return kPowerMeasTime;
        case CodeTable::AutoSweepTime:
            return kAutoSweepTime;
    }
    return {};
}

const CodeRow* findCode(CodeTable table, double code) {
    for (const CodeRow& row : codeTable(table))
        if (row.code == code) return &row;
    return nullptr;
}

std::string levelUnitText(double unitCode) {
    const CodeRow* row = findCode(CodeTable::ReferenceUnit, unitCode);
    return row == nullptr ? "dBm" : std::string(row->text);
}

double decibelsPerDivision(double rangeCode) {
    const CodeRow* row = findCode(CodeTable::Range, std::nearbyint(rangeCode));
    return row == nullptr ? 10 : row->number;
}

std::string codeCaption(CodeTable table, double code) {
    const CodeRow* row = findCode(table, code);
    if (row == nullptr || row->caption.empty()) return "";
    const std::string caption(row->caption);
    return caption.back() == '(' ? caption + std::to_string(row->code) + ")" : caption;
}

}  // namespace zel
