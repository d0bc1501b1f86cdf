#include "trace/TraceReader.h"

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <limits>
#include <utility>
#include <vector>

#include "forms/Forms.h"
#include "link/InstrumentLink.h"
#include "link/RawTrace.h"
#include "link/ZELBas.h"
#include "model/LevelRange.h"
#include "model/UnsureSettings.h"
#include "model/ZEL3Variables.h"
#include "platform/MessageBox.h"
#include "platform/Pointer.h"
#include "platform/Session.h"
#include "support/NumberText.h"
#include "trace/FrequencyLabels.h"
#include "trace/GraphScaling.h"
#include "trace/PaceMonitor.h"
#include "trace/Sweep.h"
#include "trace/TraceConversion.h"
#include "trace/TraceOnGraph.h"

namespace zel {
namespace {

constexpr std::size_t kBlock = 301;
constexpr std::size_t kSecondBlock = 300;  // the pair of point i is (sample i, sample i - 1)
constexpr double kIntervals = 300;
constexpr int kRounds = 2;  // of a query whose answer is no number
constexpr double kNone = std::numeric_limits<double>::quiet_NaN();

std::uint8_t byteOf(double number) {
    return static_cast<std::uint8_t>(static_cast<int>(std::clamp(number, 0.0, 255.0)));
}

}  // namespace

TraceReader::TraceReader(Forms& forms, ZEL3Variables& mirror, const InstrumentLink& link,
                         const TraceOnGraph& onGraph, PaceMonitor& pace, const Session& session)
    : forms_(forms),
      panel_(forms.controller),
      mirror_(mirror),
      onGraph_(onGraph.sweep),
      state_(link.state),
      exchange_(link.exchange),
      binary_(link.binary),
      conversion_(onGraph.conversion),
      scaling_(onGraph.scaling),
      pace_(pace),
      session_(session) {}

TraceReader::Step TraceReader::query(const char* word, double& field) {
    for (int round = 0; round < kRounds; ++round) {
        if (!exchange_.GetInstrument(word, panel_.InstrumentAnswer))
            return exchange_.ExchangeFailed() ? Step::LinkFailed : Step::Refused;
        if (exchange_.ExchangeFailed()) return Step::LinkFailed;
        // An answer that is no number was spoiled on its way.
        if (!mirror_.Unsure.answered(word, panel_.InstrumentAnswer)) continue;
        field = leadingNumber(panel_.InstrumentAnswer);
        return Step::Ok;
    }
    return Step::NoNumber;
}

TraceReader::Step TraceReader::queryCode(const char* word, std::uint8_t& field) {
    double number = 0;
    const Step step = query(word, number);
    if (step == Step::Ok) field = byteOf(number);
    return step;
}

TraceReader::Step TraceReader::queryDetector() {
    const Step step = queryCode("TRACEDET", mirror_.TraceDetector);
    if (step != Step::LinkFailed) state_.RestFound = false;
    return step;
}

TraceReader::Step TraceReader::queryFrequency() {
    const Step step = query("FREQ", mirror_.CenterFrequency);
    if (step != Step::Ok) return step;
    panel_.ViewCenter = mirror_.CenterFrequency;
    panel_.CFLabel.Caption = centerLabelText(panel_.InstrumentAnswer);
    return step;
}

TraceReader::Step TraceReader::querySpan() {
    const Step step = query("SPAN", mirror_.Span);
    if (step != Step::Ok) return step;
    panel_.ViewSpan = mirror_.Span;
    panel_.SpanLabel.Caption = spanLabelText(panel_.InstrumentAnswer);
    return step;
}

TraceReader::Step TraceReader::askSettings() {
    Step step = queryFrequency();
    if (step == Step::Ok) step = querySpan();
    if (step == Step::Ok) step = query("REFLVL", mirror_.ReferenceLevel);
    if (step == Step::Ok) step = query("UNIT", mirror_.ReferenceUnit);
    if (step == Step::Ok) step = query("RANGE", mirror_.ReferenceRange);
    if (step == Step::Ok) step = queryCode("DYNRANGE", mirror_.DynamicRangeMode);
    if (step == Step::Ok) step = queryDetector();
    if (step == Step::Ok) step = query("SWPTIME", mirror_.SweepTime);
    return step;
}

TraceReader::Step TraceReader::askAgain(const ReadAgain& again) {
    // What is unsure is asked whether the caller wants it or not.
    const auto wanted = [this](bool asked, AxisSetting setting) {
        return asked || mirror_.Unsure.has(setting);
    };
    Step step = Step::Ok;
    if (wanted(again.freq, AxisSetting::Frequency)) step = queryFrequency();
    if (step == Step::Ok && wanted(again.span, AxisSetting::Span)) step = querySpan();
    if (step == Step::Ok && wanted(again.refLvl, AxisSetting::ReferenceLevel))
        step = query("REFLVL", mirror_.ReferenceLevel);
    if (step == Step::Ok && wanted(again.range, AxisSetting::Range))
        step = query("RANGE", mirror_.ReferenceRange);
    if (step == Step::Ok && wanted(again.detector, AxisSetting::Detector)) step = queryDetector();
    return step;
}

TraceReader::Step TraceReader::wait() {
    if (panel_.InstrumentMode == ControllerForm::DISTTOFAULTMEASURE && mirror_.CableLength == 0) {
        // The x range needs the length; a refusal leaves it unknown.
        query("CABLELEN", mirror_.CableLength);
        if (exchange_.ExchangeFailed()) return Step::LinkFailed;
    }
    pace_.sweepWaitBegins();
    exchange_.CmdInstrument("WAIT");
    pace_.sweepWaitEnds();
    panel_.TraceIntervals = kIntervals;
    if (exchange_.ExchangeFailed()) return Step::LinkFailed;
    // A transfer that was longer than asked for shows that the detector is another one.
    return state_.RestFound ? queryDetector() : Step::Ok;
}

void TraceReader::begin() {
    pace_.cycleBegins();
    silenceToldHere_ = panel_.ContinuosLoopActive && !state_.ExchangeFailed;
    panel_.RecordData.Visible = false;
    showPointer(panel_, session_.events, kHourglass);
    panel_.PlaySingleButton.Enabled = false;
}

SweepAxis TraceReader::viewRange() const {
    SweepAxis axis;
    axis.unit = GetDimension(panel_, mirror_);
    axis.intervals = kIntervals;
    const bool distance = panel_.InstrumentMode == ControllerForm::DISTTOFAULTMEASURE;
    if (mirror_.Span != 0 && !distance) {
        axis.start = mirror_.CenterFrequency - mirror_.Span / 2;
        axis.stop = mirror_.CenterFrequency + mirror_.Span / 2;
    } else {
        axis.stop = distance ? mirror_.CableLength : mirror_.SweepTime;
    }
    return axis;
}

void TraceReader::takeSamples(const RawTrace& trace) {
    last_.wanted = trace.wanted;
    last_.came = trace.came;
    std::vector<double> wire = trace.values;
    std::fill(wire.begin() + static_cast<std::ptrdiff_t>(trace.came), wire.end(), kNone);
    if (!last_.autoPeak()) {
        last_.raw = std::move(wire);
        return;
    }
    // The second block is taken from one sample too early, as the instrument's own display has
    // it: its first value is the first block's last, and its own last one is dropped.
    last_.raw.resize(2 * kBlock);
    for (std::size_t i = 0; i < kBlock; ++i) {
        last_.raw[2 * i] = wire[i];
        last_.raw[2 * i + 1] = wire[kSecondBlock + i];
    }
}

bool TraceReader::ReadTraceData(double xFirst, double xLast) {
    last_.settings = mirror_;
    last_.instrumentMode = panel_.InstrumentMode;
    last_.time = pace_.sweepDate();
    if (!last_.autoPeak()) {
        panel_.TraceIntervals = kIntervals;
        scaling_.SizeXYVectors(static_cast<int>(kIntervals));
        double x = xFirst;
        for (double& value : panel_.XVector) {
            value = x;
            x += (xLast - xFirst) / kIntervals;
        }
        std::fill(panel_.YVector.begin(), panel_.YVector.end(), panel_.YVectorVal);
    }
    RawTrace trace;
    const bool done = binary_.GetTraceBinary(trace, last_.autoPeak());
    if (trace.wanted == 0) return done;  // refused, or silent before the transfer
    takeSamples(trace);
    last_.axis = viewRange();
    placePoints(last_);
    TraceConversion::SelectRawScale(last_);
    if (!done) {
        conversion_.ConvertTrace(last_);  // for whoever shows what came before the end
        if (last_.incomplete()) CutShort(last_);
    }
    return done;
}

void TraceReader::writeForm() const {
    panel_.ViewCenter = last_.settings.CenterFrequency;
    panel_.ViewSpan = last_.settings.Span;
    panel_.ViewXOffset = panel_.ViewSpan == 0 ? 0 : last_.axis.start;
    panel_.RawScale = last_.rawScale;
    panel_.RawTraceData = last_.physical;
    (last_.autoPeak() ? panel_.PeakTraceData : panel_.TraceData) = last_.shown;
    panel_.TraceColours = last_.colours;
    panel_.Shown = {};
    panel_.Shown.xUnit = last_.axis.unit;
    panel_.Shown.instrumentMode = last_.instrumentMode;
}

void TraceReader::scaleAndConvert() {
    scaling_.setGraphAxes(last_.axis.start, last_.axis.stop, mirror_.ReferenceLevel,
                          LevelRange::ofCode(byteOf(std::nearbyint(mirror_.ReferenceRange))));
    conversion_.ConvertTrace(last_);
    writeForm();
    last_.levelMode = onGraph_.levelMode;
    onGraph_ = last_;
    if (last_.incomplete()) CutShort(last_);
    if (recordsTraces() && last_.whole()) panel_.SaveView("trace");
}

void TraceReader::waterfallRow() {
    const bool timed = forms_.time.ContinuousRecording;
    const bool checked = forms_.specialMeas.chkWaterfall.Value();
    if (panel_.ContinuosLoopActive) return;
    if (!timed && !checked) {
        forms_.waterfall.Graph3D.removePlots();
        forms_.waterfall.Graph3D.addPlot();
        // The axis of rows that are gone would not show this one.
        scaling_.addWaterfallRowLimit();
    } else if (checked && !timed) {
        forms_.waterfall.styleLastRow();
    }
}

void TraceReader::abortView(bool& success) {
    panel_.PlaySingleButton.Enabled = true;
    // In the continuous view the silence itself was reported, and one box is enough.
    const bool known = state_.WaitLeft || state_.Ending || silenceToldHere_;
    if (!state_.DialCancelled && !known)
        session_.boxes.show({BoxIcon::Information, "Unsuccessful View"});
    showPointer(panel_, session_.events, kArrow);
    success = false;
}

void TraceReader::ReadSingleTrace(bool& success) {
    success = false;
    const DialogueScope scope(state_);
    silenceToldHere_ = false;
    last_ = {};
    if (!panel_.isConnected) {
        session_.boxes.show({BoxIcon::Information, "Please connect to the intrument first."});
        return;
    }
    begin();
    // A refused INIT leaves pointer, button and menu entry as they are.
    if (panel_.SingleSweepModeActive && !exchange_.CmdInstrument("INIT")) return;
    Step step = askSettings();
    if (step == Step::Ok) step = wait();
    if (step == Step::LinkFailed || step == Step::NoNumber) return abortView(success);
    // The x values for the waterfall are those of the trace before.
    if (step == Step::Refused || !ReadTraceData(panel_.ViewStart, panel_.ViewStop)) {
        panel_.MousePointer = kArrow;
        return;
    }
    if (!panel_.ContinuosLoopActive) {
        forms_.waterfall.resetRowCount();
        forms_.waterfall.Graph3D.clearValueLabels(2);
    }
    scaleAndConvert();
    waterfallRow();
    scaling_.DisplayDataOnGraph(onGraph_);
    pace_.drawn();
    panel_.RecordData.Visible = true;
    success = true;
    showPointer(panel_, session_.events, kArrow);
    panel_.PlaySingleButton.Enabled = true;
    panel_.RecordData.Visible = true;
}

void TraceReader::ReadSingleTrace2(const ReadAgain& again, bool& success) {
    success = false;
    const DialogueScope scope(state_);
    silenceToldHere_ = false;
    last_ = {};
    if (state_.ExchangeFailed) return abortView(success);
    const auto close = [this] {
        showPointer(panel_, session_.events, kArrow);
        panel_.PlaySingleButton.Enabled = true;
        panel_.PlayContinuousButton.Enabled = true;
        panel_.RecordData.Visible = true;
    };
    if (!panel_.isConnected) {
        if (!panel_.ErrorFlag)
            session_.boxes.show({BoxIcon::Information, "Please connect to the intrument first."});
        panel_.ErrorFlag = true;
        return close();
    }
    begin();
    if (recordsTraces() && !exchange_.CmdInstrument("INIT")) return close();
    // A loaded file has set fields of the mirror: they are the instrument's again after this.
    Step step = panel_.Shown.fromFile ? askSettings() : askAgain(again);
    if (step == Step::Ok) step = wait();
    if (step == Step::LinkFailed || step == Step::NoNumber) return abortView(success);
    if (step == Step::Refused) return close();
    const SweepAxis axis = viewRange();
    if (!ReadTraceData(axis.start, axis.stop)) return close();
    scaleAndConvert();
    scaling_.DisplayDataOnGraph(onGraph_);
    pace_.drawn();
    panel_.RecordData.Visible = true;
    success = true;
    close();
}

}  // namespace zel
