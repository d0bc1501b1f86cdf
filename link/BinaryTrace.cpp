#include "link/BinaryTrace.h"

#include <cstddef>
#include <cstdint>
#include <vector>

#include "forms/ControllerForm.h"
#include "link/AnswerReader.h"
#include "link/BinaryReader.h"
#include "link/ByteLink.h"
#include "link/CommandExchange.h"
#include "link/InstrumentErrors.h"
#include "link/LinkDelays.h"
#include "link/RawTrace.h"
#include "link/ZELBas.h"
#include "platform/MessageBox.h"
#include "platform/Session.h"
#include "support/ByteCast.h"
#include "support/NumberText.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr std::size_t kBlockBytes = 1204;  // 301 samples, without the separator
constexpr std::size_t kSampleBytes = 4;
constexpr int kReRequestMs = 10000;
constexpr int kPollMs = 20;

}  // namespace

BinaryTrace::BinaryTrace(ControllerForm& panel, ZELBas& state, ByteLink& link, AnswerReader& reader,
                         BinaryReader& bytes, const Session& session)
    : panel_(panel),
      state_(state),
      link_(link),
      reader_(reader),
      bytes_(bytes),
      session_(session),
      StopwatchA_(session.clock) {}

void BinaryTrace::delay(DelayPlace place) {
    const int ms = linkDelay(place, panel_.ConnectionState);
    if (ms > 0) session_.events.sleep(ms);
}

void BinaryTrace::startingError(int status, const char* keyword) {
    session_.boxes.show({BoxIcon::Information, "GET error" + numberText(status) + " for command <" +
                                                   keyword + "> (while starting)"});
}

BinaryTrace::Round BinaryTrace::beginRound() const {
    return {panel_.ContinuosLoopActive, panel_.RecordDataFlag, panel_.isConnected};
}

bool BinaryTrace::mayAskAgain(const Round& round) const {
    const bool stopped = (round.looping && !panel_.ContinuosLoopActive) ||
                         (round.recording && !panel_.RecordDataFlag);
    const bool disconnected = round.connected && !panel_.isConnected;
    if (state_.mustLeave(session_.clock.micros())) return false;
    return !stopped && !disconnected && link_.usable();
}

bool BinaryTrace::GetTraceBinary(RawTrace& trace, bool doubleBlock) {
    const DialogueScope scope(state_);
    trace.wanted = trace.came = 0;
    const Round round = beginRound();
    for (;;) {
        session_.DebugLine("Binary trace transfer starting");
        const auto t0 = static_cast<float>(session_.clock.secondsOfDay());
        bool success = false;
        switch (readOnce(trace, doubleBlock, success)) {
            case Outcome::AskAgain:
                if (mayAskAgain(round)) continue;
                return false;
            case Outcome::Failed:
                return false;
            case Outcome::Done:
                break;
        }
        if (success) session_.DebugLine("Trace complete");
        session_.DebugLine("Binary trace transfer finished (" +
                           elapsedSecondsText(session_.clock, t0) + " s)");
        return success;
    }
}

BinaryTrace::Outcome BinaryTrace::readOnce(RawTrace& trace, bool doubleBlock, bool& success) {
    state_.InputBuffer.clear();
    link_.WriteToLink("GET\r");
    delay(DelayPlace::AfterTraceGet);
    int status = statusNumber(reader_.ReadModeStatus());
    if (!reader_.answered()) return Outcome::Failed;
    if (status != 0) {
        startingError(status, "TRACEBIN");
        return Outcome::Done;
    }
    panel_.BinaryModeActive = true;
    link_.WriteToLink("TRACEBIN\r");
    delay(DelayPlace::AfterTraceKeyword);
    const bool open = link_.usable();  // a port closed before is reported by the read
    const std::string bytes = bytes_.ReadBinaryBuffer(doubleBlock ? kDoubleBytes : kSingleBytes);
    if (bytes.size() == 2 && bytes[1] == '\r') {
        status = bytes[0] - '0';
        if (status == 1) return Outcome::AskAgain;
        if (status >= 2 && status <= 7) {
            ReportInstrumentError(state_, session_.boxes, status, "TRACEBIN");
            return Outcome::Done;
        }
    }
    decode(bytes, doubleBlock, trace);
    if (!link_.usable() && !trace.whole()) {  // the line has gone in the middle
        if (open && !link_.isTcp()) {
            std::string text = "Port is not open!";
            if (!link_.problem().empty()) text += kCrLf + link_.problem();
            session_.boxes.show({BoxIcon::Critical, text});
        }
        state_.ExchangeFailed = true;
        return Outcome::Failed;
    }
    success = true;
    return Outcome::Done;
}

void BinaryTrace::decode(const std::string& bytes, bool doubleBlock, RawTrace& trace) {
    const std::size_t asked = static_cast<std::size_t>(doubleBlock ? kDoubleBytes : kSingleBytes);
    trace.wanted = doubleBlock ? kDoubleSamples : kSingleSamples;
    trace.values.resize(trace.wanted);
    std::size_t output = 0;
    std::int16_t& index = state_.BinaryDecodeIndex;
    for (index = 0; output < trace.wanted; index = static_cast<std::int16_t>(index + 4)) {
        if (doubleBlock && index == static_cast<std::int16_t>(kBlockBytes)) ++index;
        if (static_cast<std::size_t>(index) + 4 > bytes.size()) break;
        trace.values[output++] =
            int32FromLittleEndian(reinterpret_cast<const unsigned char*>(bytes.data()) + index);
    }
    // Less than a sample is missing: nobody knows where, and all after that place is shifted.
    const bool lostInside = bytes.size() < asked && bytes.size() + kSampleBytes > asked;
    trace.came = lostInside ? 0 : output;
}

bool BinaryTrace::GetCTraceBinary(std::vector<double>& values) {
    const DialogueScope scope(state_);
    const Round round = beginRound();
    session_.DebugLine("Binary ctrace transfer starting");
    for (;;) {
        state_.ComplexTraceActive = true;
        const auto t0 = static_cast<float>(session_.clock.secondsOfDay());
        bool success = false;
        const Outcome outcome = readComplexOnce(values, success);
        if (outcome == Outcome::Failed) return false;
        if (outcome == Outcome::AskAgain || state_.ComplexTraceRequested) {
            state_.ComplexTraceRequested = false;
            if (mayAskAgain(round)) continue;
            return false;
        }
        session_.DebugLine("Binary trace transfer finished (" +
                           elapsedSecondsText(session_.clock, t0) + " s)");
        state_.ComplexTraceActive = false;
        return success;
    }
}

BinaryTrace::Outcome BinaryTrace::readComplexOnce(std::vector<double>& values, bool& success) {
    state_.InputBuffer.clear();
    link_.WriteToLink("GET\r");
    delay(DelayPlace::AfterComplexGet);
    int status = statusNumber(reader_.ReadModeStatus());
    if (!reader_.answered()) return Outcome::Failed;
    if (status != 0) {
        startingError(status, "CTRACEBIN");
        return Outcome::Done;
    }
    panel_.BinaryModeActive = true;
    link_.WriteToLink("CTRACEBIN\r");
    delay(DelayPlace::AfterComplexKeyword);
    status = statusNumber(reader_.ReadAnswer());
    if (!reader_.answered()) return Outcome::Failed;
    if (status != 0) {
        std::string text =
            "CMD error" + numberText(status) + " for command <CTRACEBIN> (while executing)";
        if (status == 2) text += std::string(kCrLf) + "Command not allowed in currend mode";
        session_.boxes.show({BoxIcon::Information, text});
        ReportInstrumentError(state_, session_.boxes, status, panel_.CommandLine);
        return Outcome::Done;
    }
    std::string bytes = ReadLiteralBytes(kDoubleBytes);
    if (bytes.size() < static_cast<std::size_t>(kDoubleBytes)) return Outcome::AskAgain;
    bytes.erase(kBlockBytes, 1);  // the separator of the first block
    values.resize(kDoubleSamples);
    const auto* sample = reinterpret_cast<const unsigned char*>(bytes.data());
    for (double& value : values) {
        value = int32FromLittleEndian(sample);
        sample += kSampleBytes;
    }
    success = true;
    session_.DebugLine("Trace complete");
    return Outcome::Done;
}

std::string BinaryTrace::ReadLiteralBytes(std::int32_t count) {
    const Round round = beginRound();
    const auto wanted = static_cast<std::size_t>(count);
    StopwatchA_.Reset();
    state_.ComplexTraceRequested = false;
    for (;;) {
        if (!link_.usable()) {
            if (link_.isTcp()) {
                link_.tellLoss();
            } else {
                session_.boxes.show({BoxIcon::Critical, "Port is not open!"});
            }
            return "";
        }
        if (!mayAskAgain(round)) return "";
        state_.InputBuffer += link_.ReadFromLink(true);
        session_.events.pump();
        const auto length = static_cast<double>(state_.InputBuffer.size());
        session_.DebugLine("BIN-BUFFER-LEN: " + numberText(length));
        if (state_.InputBuffer.size() >= wanted) break;
        if (StopwatchA_.Elapsed() > kReRequestMs) {
            link_.WriteToLink("get\r");
            delay(DelayPlace::ReRequestAfterGet);
            link_.ReadFromLink(true);
            link_.WriteToLink(state_.ComplexTraceActive ? "CTRACEBIN\r" : "TRACEBIN\r");
            if (state_.ComplexTraceActive) state_.ComplexTraceRequested = true;
            delay(DelayPlace::ReRequestAfterKeyword);
            StopwatchA_.Reset();
            state_.InputBuffer.clear();
            continue;
        }
        if (link_.isTcp()) continue;  // its read waits by itself
        session_.events.wait(kPollMs);
    }
    std::string result = state_.InputBuffer.substr(0, wanted);
    state_.InputBuffer.erase(0, wanted);
    session_.DebugLine("MY INBUFFER LEN IS: " + numberText(static_cast<double>(result.size())));
    return result;
}

}  // namespace zel
