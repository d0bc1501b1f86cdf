#include "ZELSim/Words.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstddef>
#include <span>
#include <string>
#include <string_view>
#include <unordered_map>

#include "ZELSim/Device.h"
#include "ZELSim/Numbers.h"
#include "ZELSim/Settings.h"
#include "ZELSim/WordActions.h"

namespace zelsim {
namespace {

constexpr unsigned kCmd = static_cast<unsigned>(Verb::Cmd);
constexpr unsigned kSet = static_cast<unsigned>(Verb::Set);
constexpr unsigned kGet = static_cast<unsigned>(Verb::Get);
constexpr unsigned kBoth = kSet | kGet;

constexpr unsigned in(Mode mode) { return 1U << static_cast<unsigned>(mode); }
constexpr unsigned kAll = 0x1FE;
constexpr unsigned kTrace = kAll & ~in(Mode::PowerSensor);
constexpr unsigned kPower =
    in(Mode::ChannelPower) | in(Mode::OccupiedBandwidth) | in(Mode::TdmaPower);
constexpr unsigned kTimed = in(Mode::PowerSensor) | in(Mode::TdmaPower);
constexpr unsigned kComplex = in(Mode::Analyzer) | in(Mode::TrackingGenerator) |
                              in(Mode::DistanceToFault) | in(Mode::Receiver);
constexpr unsigned kSensor = in(Mode::PowerSensor);
constexpr unsigned kTracking = in(Mode::TrackingGenerator);
constexpr unsigned kChannel = in(Mode::ChannelPower);
constexpr unsigned kOcc = in(Mode::OccupiedBandwidth);
constexpr unsigned kTdma = in(Mode::TdmaPower);
constexpr unsigned kDistance = in(Mode::DistanceToFault);

constexpr double kAny = 1e15;  // the setter knows the bounds
using S = Settings;
using A = WordActions;
constexpr auto N = Kind::Number;
constexpr auto C = Kind::Code;
constexpr auto T = Kind::Text;
constexpr auto O = Kind::None;

// The rows that need few columns.
constexpr Word command(std::string_view name, unsigned modes,
                       int (*act)(Device&, std::string_view) = nullptr) {
    return {name, kCmd, O, 0, 0, modes, false, {}, {}, 0, {}, {}, act};
}
constexpr Word reading(std::string_view name, unsigned modes, std::string (*get)(Device&)) {
    return {name, kGet, N, 0, 0, modes, false, {}, {}, 0, {}, get};
}
constexpr Word block(std::string_view name, unsigned modes) {
    return {name, kGet, O, 0, 0, modes, false};
}
constexpr Word text(std::string_view name, unsigned modes, bool sweeps, std::string S::*member) {
    return {name, kBoth, T, 0, 0, modes, sweeps, {}, member};
}

// name, verbs, kind, range, modes, new sweep, member, text member, places, setter, getter
constexpr auto kWords = std::to_array<Word>({
    {"FREQ", kBoth, N, -kAny, kAny, kAll, false, {}, {}, 0, A::setFrequency, A::frequency},
    {"SPAN", kBoth, N, 0, 3e9, kTrace, false, &S::span, {}, 0, A::setSpan},
    {"FREQOFFS", kBoth, N, -1e11, 1e11, kAll, false, &S::frequencyOffset},
    {"REFLVL", kBoth, N, -kAny, kAny, kTrace, true, {}, {}, 0, A::setReference, A::reference},
    {"REFLVLOFFS", kBoth, N, -200, 200, kTrace, false, &S::referenceOffset, {}, 3},
    {"RANGE", kBoth, C, 0, 8, kTrace, false, &S::range},
    {"UNIT", kBoth, C, 0, 8, kTrace, false, &S::unit},
    {"RFINPUT", kBoth, C, 0, 1, kTrace, false, &S::rfInput},
    {"DYNRANGE", kBoth, C, 0, 1, kTrace, true, &S::lowNoise},
    {"RBW", kBoth, C, 0, 10, kTrace, true, &S::rbw},
    {"VBW", kBoth, C, 0, 12, kTrace, true, &S::vbw},
    {"SWPTIME", kBoth, N, 0, 1000, kTrace, true, {}, {}, 0, A::setSweepTime, A::sweepTime},
    {"SWPCONT", kBoth, C, 0, 1, kTrace, false, &S::continuous, {}, 0, A::setContinuous},
    {"TRIGSRC", kBoth, C, 0, 3, kTrace, true, &S::triggerSource},
    {"TRIGLVL", kBoth, N, 0, 100, kTrace, true, &S::triggerLevel, {}, 3},
    {"TRIGDEL", kBoth, N, 0, 100, kTrace, true, &S::triggerDelay, {}, 9},
    {"TRACEMODE", kBoth, C, 0, 4, kTrace, false, &S::traceMode, {}, 0, A::setTraceMode},
    {"TRACEDET", kBoth, C, 0, 4, kAll, true, {}, {}, 0, A::setDetector, A::detector},
    {"MEAS", kBoth, C, 1, 8, kAll, false, &S::mode, {}, 0, A::setMode},
    {"BAUD", kBoth, C, 0, 3, kAll, false, &S::baud},

    reading("IDN", kAll, A::identity),
    reading("LEVEL", kTrace, A::level),

    {"MARK1ON", kBoth, C, 0, 1, kTrace, false, &S::markerOn, {}, 0, A::setMarkerOn},
    {"DELTA1ON", kBoth, C, 0, 1, kTrace, false, &S::deltaOn, {}, 0, A::setDeltaOn},
    {"MARK1", kBoth, N, -kAny, kAny, kTrace, false, {}, {}, 0, A::setMarker, A::marker},
    {"DELTA1", kBoth, N, -kAny, kAny, kTrace, false, {}, {}, 0, A::setDelta, A::delta},
    {"MARKMODE", kBoth, C, 0, 2, kTrace, false, &S::markerMode},

    text("TRD1", kTrace, false, &S::transducer1),
    text("TRD2", kTrace, false, &S::transducer2),
    text("LIMLOW", kTrace, false, &S::lowerLimit),
    text("LIMUPP", kTrace, false, &S::upperLimit),
    reading("LIMPASS", kTrace, A::limits),

    {"TGLVL", kBoth, N, -20, 0, kTracking, true, &S::trackingLevel, {}, 1},
    {"TRANSCAL", kGet, C, 0, 1, kTracking, false, &S::transmissionCal},
    {"REFLCAL", kGet, C, 0, 1, kTracking, false, &S::reflectionCal},
    {"TRANSVECTCAL", kGet, C, 0, 1, kTracking, false, &S::transmissionVectorCal},
    {"REFLVECTCAL", kGet, C, 0, 1, kTracking, false, &S::reflectionVectorCal},

    reading("PWR", kSensor, A::sensorPower),
    reading("REFL", kSensor, A::sensorReflection),
    {"MEASTIME", kBoth, N, -kAny, kAny, kTimed, true, {}, {}, 0, A::setMeasTime, A::measTime},

    reading("CHPWR", kChannel, A::channelPower),
    {"CHPWRSTD", kBoth, C, 0, 3, kChannel, true, &S::channelStandard, {}, 0, A::setChannelStd},
    {"CHPWRUNIT", kBoth, C, 0, 2, kChannel, false, &S::channelUnit},
    {"CHPWRBW", kBoth, N, 1e3, 1e9, kChannel, false, &S::channelBandwidth, {}, 0, A::setChannelHz},
    reading("OBW", kOcc, A::occupiedBandwidth),
    {"OBWSTD", kBoth, C, 0, 3, kOcc, true, &S::occupiedStandard, {}, 0, A::setOccupiedStd},
    {"OBWCHBW", kBoth, N, 1e3, 1e9, kOcc, false, &S::occupiedBandwidth, {}, 0, A::setOccupiedHz},
    reading("TDMAPWR", kTdma, A::tdmaPower),
    {"TDMASTD", kBoth, C, 0, 1, kTdma, true, &S::tdmaStandard, {}, 0, A::setTdmaStandard},

    text("CABLEMOD", kDistance, true, &S::cableModel),
    {"CABLELEN", kBoth, N, 1, 1000, kDistance, true, &S::cableLength, {}, 3},
    {"DTFMODE", kBoth, C, 0, 2, kDistance, true, &S::dtfMode},
    text("LENUNIT", kDistance, false, &S::lengthUnit),

    block("TRACEBIN", kTrace),
    block("CTRACEBIN", kComplex),

    command("WAIT", kTrace),
    command("INIT", kTrace, A::init),
    command("RESTART", kTrace, A::init),
    command("REMOTE", kAll, A::remote),
    command("LOCAL", kAll, A::local),
    command("PRESET", kAll, A::preset),
    command("SAVE", kAll, A::save),
    command("RECALL", kAll, A::recall),
    command("MARKPK", kTrace, A::markerPeak),
    command("MARKNXTPK", kTrace, A::markerNextPeak),
    command("MARKMIN", kTrace, A::markerMinimum),
    command("MARKTOCENT", kTrace, A::markerToCentre),
    command("MARKTOLVL", kTrace, A::markerToReference),
    command("LVLADJUST", kPower, A::levelAdjust),
    command("PWRTOREF", kSensor, A::powerToReference),
    command("ZERO", kSensor, A::nothing),
    command("LIMDEL", kTrace, A::deleteLimits),
    command("THROFF", kTrace, A::nothing),
    command("TRACETOMEM", kTrace, A::nothing),
    command("CAL_DTF", kDistance, A::nothing),
    command("CAL_TGSCLTRN", kTracking, A::calibrate<&S::transmissionCal>),
    command("CAL_TGSCLRFL", kTracking, A::calibrate<&S::reflectionCal>),
    command("CAL_TGVECTRN", kTracking, A::calibrate<&S::transmissionVectorCal>),
    command("CAL_TGVECRFL", kTracking, A::calibrate<&S::reflectionVectorCal>),
});

constexpr std::size_t kLongestText = 32;

bool wordAllowed(const Device& device, const Word& word) {
    return (word.modes >> static_cast<unsigned>(device.settings().mode) & 1U) != 0;
}

// In local state the front panel owns the settings; mode and baud rate can be set all the same,
// which is how a session gets hold of an instrument.
bool settableNow(const Device& device, const Word& word) {
    return device.remote() || word.name == "MEAS" || word.name == "BAUD";
}

int setText(Device& device, const Word& word, std::string_view value) {
    const bool printable = std::all_of(value.begin(), value.end(), [](char c) {
        return c >= ' ' && static_cast<unsigned char>(c) < 0x7F;
    });
    if (value.empty() || !printable) {
        return kSyntax;
    }
    if (value.size() > kLongestText) {
        return kOutOfRange;
    }
    const std::string upper = upperCase(value);
    device.edit().*word.text = upper == "NONE" ? upper : std::string(value);
    if (word.sweeps) {
        device.restart();
    }
    return kAccepted;
}

int setNumber(Device& device, const Word& word, std::string_view text) {
    const auto value = parseNumber(text);
    if (!value) {
        return kSyntax;
    }
    const bool whole = word.kind != Kind::Code || *value == std::floor(*value);
    if (!whole || *value < word.low || *value > word.high) {
        return kOutOfRange;
    }
    if (word.set != nullptr) {
        return word.set(device, *value);
    }
    device.edit().*word.number = *value;
    if (word.sweeps) {
        device.restart();
    }
    return kAccepted;
}

Answer query(Device& device, const Word& word) {
    Answer answer;
    answer.hasValue = true;
    if (word.name == "TRACEBIN") {
        answer.binary = true;
        answer.value = device.traceBlock();
    } else if (word.name == "CTRACEBIN") {
        answer.binary = true;
        answer.value = device.complexBlock();
    } else if (word.get != nullptr) {
        answer.value = word.get(device);
    } else if (word.text != nullptr) {
        answer.value = device.settings().*word.text;
    } else {
        answer.value = numberText(device.settings().*word.number, word.decimals);
    }
    return answer;
}

}  // namespace

std::span<const Word> words() { return kWords; }

const Word* findWord(std::string_view name) {
    static const auto index = [] {
        std::unordered_map<std::string_view, const Word*> rows;
        for (const Word& word : kWords) {
            rows.emplace(word.name, &word);
        }
        return rows;
    }();
    const auto found = index.find(upperCase(name));
    return found == index.end() ? nullptr : found->second;
}

Answer execute(Device& device, Verb verb, std::string_view line) {
    line = trimmed(line);
    const auto comma = line.find(',');
    std::string_view name = trimmed(line.substr(0, comma));
    const bool hasArgument = comma != std::string_view::npos;
    const std::string_view argument =
        hasArgument ? trimmed(line.substr(comma + 1)) : std::string_view{};
    if (verb == Verb::Get && !name.empty() && name.back() == '?') {
        name.remove_suffix(1);
    }
    const auto refused = [](int status) {
        Answer answer;
        answer.status = status;
        return answer;
    };
    const Word* word = findWord(name);
    const bool shaped = verb == Verb::Cmd || hasArgument == (verb == Verb::Set);
    if (word == nullptr || (word->verbs & static_cast<unsigned>(verb)) == 0 || !shaped) {
        return refused(kSyntax);
    }
    if (!wordAllowed(device, *word)) {
        return refused(kWrongMode);
    }
    if (verb == Verb::Get) {
        if ((word->name == "MARK1" && device.settings().markerOn == 0) ||
            (word->name == "DELTA1" && device.settings().deltaOn == 0)) {
            return refused(kNotAllowed);
        }
        return query(device, *word);
    }
    if (verb == Verb::Set) {
        if (!settableNow(device, *word)) {
            return refused(kNotAllowed);
        }
        return refused(word->kind == Kind::Text ? setText(device, *word, argument)
                                                : setNumber(device, *word, argument));
    }
    if (word->act == nullptr) {
        Answer answer;
        answer.waitsForSweep = true;  // WAIT is the one command without an action
        return answer;
    }
    return refused(word->act(device, argument));
}

}  // namespace zelsim
