#pragma once
// A connected session that reads traces.

#include <map>
#include <string>

#include "tests/Session.h"
#include "trace/TraceReader.h"

namespace zel {

struct Setting {
    const char* word;
    const char* value;
};

/// What a full cycle asks, in its order: 1.5 GHz, 1 MHz, -20 dBm at 5 dB a division, sample.
inline constexpr Setting kSettings[] = {
    {"FREQ", "1500000000"}, {"SPAN", "1000000"}, {"REFLVL", "-20"}, {"UNIT", "0"},
    {"RANGE", "1"},         {"DYNRANGE", "1"},   {"TRACEDET", "3"}, {"SWPTIME", "0.02"}};

struct ReadCycle : TestSession, ::testing::Test {
    ReadCycle() { startConnected(); }

    /// The first `count` queries of a full cycle, some with other answers.
    void askSettings(int count = 8, const std::map<std::string, std::string>& others = {}) {
        for (int i = 0; i < count; ++i) {
            const auto other = others.find(kSettings[i].word);
            get(kSettings[i].word, other == others.end() ? kSettings[i].value : other->second);
        }
    }
    /// Recording is on, and its file takes all and keeps none.
    void recordIntoNothing() {
        panel.RecordDataFlag = true;
        platform.files.putOther("/dev/null");
        panel.CommonDialog1FileName = "/dev/null";
        mirror.ResolutionBandwidth = mirror.VideoBandwidth = 1;
    }
    bool readFull() {
        bool success = true;
        program.traces().ReadSingleTrace(success);
        return success;
    }
    bool readAgain(const ReadAgain& again) {
        bool success = true;
        program.traces().ReadSingleTrace2(again, success);
        return success;
    }
};

}  // namespace zel
