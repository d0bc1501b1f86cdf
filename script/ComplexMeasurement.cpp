#include "script/ComplexMeasurement.h"

#include <cstddef>
#include <cstdint>
#include <limits>
#include <numeric>
#include <string>
#include <vector>

#include "script/ScriptFailure.h"
#include "script/Statistics.h"
#include "support/NumberText.h"

namespace zel {

void ComplexMeasurement::measureCTrace(std::vector<double>& data, double& meanLevel,
                                       double& meanPhase, double& stdLevel, double& stdPhase) {
    scaleComplexTrace(data);
    const TraceStatistics trace = statisticsOf(data);
    const bool radians = statistics_.optRadians.Value();
    const bool first = form_.ctraceMeasurementNo == 1;
    const auto save = [this](const char* name, double value) {
        results_.saveValue(name, numberText(value));
    };
    meanLevel = trace.meanLevel;
    meanPhase = trace.meanPhase;
    stdLevel = trace.stdLevel;
    std::string saved = form_.DataFileNameSpec;
    results_.buildOutputFileName(0, false, "VALUES", saved);
    save("NEXT MEAS:", form_.ctraceMeasurementNo);
    if (first) statistics_.refMeasLevel = meanLevel;
    save("meanLvl", first ? meanLevel : meanLevel - statistics_.refMeasLevel);
    results_.buildOutputFileName(0, false, "*", saved);
    save("stDevLvl", stdLevel);
    form_.DataFileNameSpec = saved;
    for (std::size_t i = kTracePoints; i < 2 * kTracePoints; ++i) save("CTRACE_TEMP", data[i]);
    const double phase = radians ? meanPhase : meanPhase * kDegreesPerRadian;
    if (first) statistics_.refPhase = phase;
    save("meanPhase", first ? phase : phase - statistics_.refPhase);
    save("stdDevPh(rad)", trace.stdPhase);
    save("stdDevPh(deg)", trace.stdPhase * kDegreesPerRadian);
    stdPhase = radians ? trace.stdPhase : trace.stdPhase * kDegreesPerRadian;
}

bool ComplexMeasurement::takeTrace(bool first, std::size_t element, Result& result) {
    line_.exchange.CmdInstrument("INIT");
    if (first && !line_.state.ExchangeFailed) line_.exchange.CmdInstrument("WAIT");
    if (line_.state.ExchangeFailed || !line_.binary.GetCTraceBinary(line_.mirror.CTraceData))
        return false;
    measureCTrace(line_.mirror.CTraceData, result.meanLevel, result.meanPhase, result.stdLevel,
                  result.stdPhase);
    form_.meanLevelSamples.resize(element + 1);
    form_.meanPhaseSamples.resize(element + 1);
    form_.meanLevelSamples[element] = result.meanLevel;
    form_.meanPhaseSamples[element] = result.meanPhase;
    return true;
}

void ComplexMeasurement::measure() {
    statistics_.cmdExecute.Enabled = false;
    if (!statistics_.Visible) statistics_.Show();
    if (form_.ctraceMeasurementNo == std::numeric_limits<std::int16_t>::max())
        throw ScriptFailure(kOverflow);
    ++form_.ctraceMeasurementNo;
    const int count = line_.mirror.CTraceAverageCount;
    Result result;
    bool taken = true;
    for (int i = 1; i <= count && taken; ++i) {
        if (!form_.continueRun) return;
        statistics_.lblAvgCount.Caption = std::to_string(count - i + 1);
        taken = takeTrace(i == 1, static_cast<std::size_t>(i), result);
    }
    if (count == 0) taken = takeTrace(true, 0, result);
    statistics_.lblAvgCount.Caption = "";
    if (!taken) {
        statistics_.cmdExecute.Enabled = true;
        return;
    }
    if (count == 0) throw ScriptFailure(kOverflow);  // no trace counts: 0 divided by 0
    if (count > 0) {
        const auto mean = [count](const std::vector<double>& samples) {
            const auto first = samples.begin() + 1;
            return std::accumulate(first, first + count, 0.0) / count;
        };
        result.meanLevel = mean(form_.meanLevelSamples);
        result.meanPhase = mean(form_.meanPhaseSamples);
    }
    if (form_.ctraceMeasurementNo == 1) {
        statistics_.refMeasLevel = result.meanLevel;
        statistics_.refPhase = statistics_.optRadians.Value()
                                   ? result.meanPhase
                                   : result.meanPhase * kDegreesPerRadian;
    }
    display_.displayPhaseMeasurement(result.meanLevel, result.stdLevel, result.meanPhase,
                                     result.stdPhase);
    results_.saveDisplayedMeasurement(result.meanLevel, result.stdLevel, result.meanPhase,
                                      result.stdPhase);
    results_.restoreOutputFileName();
    statistics_.cmdExecute.Enabled = true;
}

}  // namespace zel
