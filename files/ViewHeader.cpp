#include "files/ViewHeader.h"

#include <string>

#include "files/OutputFile.h"
#include "files/ViewFormat.h"
#include "forms/ControllerForm.h"
#include "model/CodeTables.h"
#include "model/ZEL3Variables.h"
#include "support/NumberText.h"

namespace zel {
namespace {

using CF = ControllerForm;

/// The word in a file of a code; empty for none.
std::string savedWord(CodeTable table, double code) {
    const CodeRow* row = findCode(table, code);
    return row == nullptr ? "" : std::string(row->saved);
}

void field(OutputFile& file, const std::string& name, const std::string& value) {
    file.line(name + ";" + value);
}

void number(OutputFile& file, const std::string& name, double value) {
    field(file, name, generalNumber(value));
}

/// A line only where the code has a word.
void coded(OutputFile& file, const std::string& name, CodeTable table, double code) {
    const std::string word = savedWord(table, code);
    if (!word.empty()) field(file, name, word);
}

/// "CHAN PWR USER" or the standard's name; empty for a code that is no standard.
std::string standardName(const char* user, int standard) {
    const std::string word = savedWord(CodeTable::Standard, standard);
    return standard == STDUSER ? user + std::string(" ") + word : word;
}

/// What the measurement of one of the four modes with a choice is called; else empty.
std::string measurementName(int mode, const ZEL3Variables& mirror) {
    switch (mode) {
        case CF::CHANNELPOWER:
            return standardName("CHAN PWR", mirror.ChannelPowerStandard);
        case CF::OCCBANDWIDTH:
            return standardName("OBW", mirror.OccBWStandard);
        case CF::TDMAPOWERMODE:
            return savedWord(CodeTable::TDMAStandard, mirror.TDMAStandard);
        case CF::DISTTOFAULTMEASURE:
            return savedWord(CodeTable::DTFMode, mirror.DTFMode);
        default:
            return "";
    }
}

bool hasMeasurement(int mode) { return mode >= CF::CHANNELPOWER && mode <= CF::DISTTOFAULTMEASURE; }

void measurementType(OutputFile& file, int mode, const std::string& measurement) {
    const bool byStandard = mode == CF::CHANNELPOWER || mode == CF::OCCBANDWIDTH;
    if (byStandard && measurement.empty()) return;
    coded(file, kMeasurementType, CodeTable::MeasurementMode, mode);
}

struct Positions {
    int mode;
    const char* start;
    const char* stop;
};
constexpr Positions kPositions[] = {{CF::CHANNELPOWER, "25", "275"},
                                    {CF::OCCBANDWIDTH, "1", "299"},
                                    {CF::TDMAPOWERMODE, "1", "299"}};

/// The result of a power measurement, with its unit.
std::string measuredValue(int mode, const ZEL3Variables& mirror) {
    switch (mode) {
        case CF::CHANNELPOWER:
            return generalNumber(mirror.ChannelPowerValue) + " " +
                   ChannelPowerUnitText(mirror.ChannelPowerUnit, "CHNPWR");
        case CF::OCCBANDWIDTH:
            return generalNumber(mirror.OccBWValue) + " Hz";
        default:
            return generalNumber(mirror.TDMAPowerValue) + " dBm";
    }
}

}  // namespace

void ViewHeader::write(OutputFile& file) const {
    const bool fault = mode == CF::DISTTOFAULTMEASURE;
    const std::string measurement = measurementName(mode, settings);

    if (hasMeasurement(mode)) {
        if (!measurement.empty()) field(file, "Trace Name", measurement);
    } else {
        coded(file, "Trace Name", CodeTable::MeasurementMode, mode);
    }
    const double now = clock.date();
    field(file, "Date", clock.dateText(now));
    field(file, kTime, clock.timeText(now));
    number(file, "Instrument Model Number", settings.InstrumentModel);
    number(file, "Instrument Serial Number", settings.InstrumentSerial);
    measurementType(file, mode, measurement);
    field(file, kDynamicRange, settings.DynamicRangeMode != 0 ? "Low Noise" : "Low Distortion");
    if (!measurement.empty()) field(file, "Measurement", measurement);
    number(file, "Center Frequency", settings.CenterFrequency);
    field(file, "Span", settings.Span == 0 ? kZeroSpan : generalNumber(settings.Span));
    if (!fault) number(file, "Frequency Offset", settings.FrequencyOffset);
    number(file, kSweepTime, settings.SweepTime);
    if (!fault) {
        coded(file, "Trigger Mode", CodeTable::TriggerSource, settings.TriggerSource);
        number(file, "Trigger Delay", settings.TriggerDelay);
        number(file, "Trigger Level", settings.TriggerLevelValue);
    }

    struct Bandwidth {
        const char* name;
        const char* word;
        CodeTable table;
        double value;
    };
    const Bandwidth bandwidths[] = {
        {kResolutionBandwidth, "RBW", CodeTable::ResolutionBandwidth, settings.ResolutionBandwidth},
        {kVideoBandwidth, "VBW", CodeTable::VideoBandwidth, settings.VideoBandwidth},
    };
    for (const Bandwidth& row : bandwidths) {
        if (row.value == 0) {
            askBandwidth(row.word);
        } else if (const CodeRow* code = findCode(row.table, row.value)) {
            number(file, row.name, code->number);
        }
    }

    coded(file, kReferenceUnit, CodeTable::ReferenceUnit, settings.ReferenceUnit);
    coded(file, kReferenceRange, CodeTable::Range, settings.ReferenceRange);
    number(file, kReferenceLevel, settings.ReferenceLevel);
    number(file, "Reference Offset", settings.ReferenceOffset);
    field(file, "Input Value (Ohm)", "50");
    coded(file, "Trace Mode", CodeTable::TraceMode, settings.TraceMode);
    coded(file, kTraceDetector, CodeTable::Detector, settings.TraceDetector);
    field(file, "RF Attenuator Setting", "0");
    if (mode == CF::CHANNELPOWER) number(file, "Channel Bandwidth", settings.ChannelPowerBandwidth);
    if (mode == CF::OCCBANDWIDTH) number(file, "Channel Bandwidth", settings.OccBWChannelBandwidth);
    if (mode == CF::TDMAPOWERMODE) number(file, "TDMA Time", settings.TDMAMeasTime);
    if (fault) {
        field(file, "Cable", "<none>");
        field(file, "Cable Length", generalNumber(settings.CableLength) + " m");
    } else {
        field(file, "Transducer", "- - -");
        field(file, "Transducer (dB)", "- - -");
        field(file, "Transducer Offset", "0");
    }
    field(file, "Trace Unit Offset", "2147483647");
    field(file, kTraceWritePointer, "301");
    for (const Positions& row : kPositions) {
        if (row.mode != mode) continue;
        field(file, "Start Position", row.start);
        field(file, "Stop Position", row.stop);
        field(file, kMeasuredValue, measuredValue(mode, mirror));
    }
    file.line("");
}

}  // namespace zel
