#pragma once
// The instrument's words: one table row each, and what a word does to the device.

#include <span>
#include <string>
#include <string_view>

#include "ZELSim/Device.h"
#include "ZELSim/Settings.h"

namespace zelsim {

/// The mode words of the line protocol.
enum class Verb : unsigned { Cmd = 1, Set = 2, Get = 4 };

/// Status digits of the line protocol.
enum Status : int {
    kAccepted = 0,
    kSyntax = 1,
    kWrongMode = 2,
    kStorageFull = 3,
    kNotAllowed = 4,
    kOutOfRange = 5,
};

/// The instrument's answer to the second line of an exchange.
struct Answer {
    int status = kAccepted;
    bool hasValue = false;
    std::string value;  ///< text, or with `binary` the bytes after the status line
    bool binary = false;
    bool waitsForSweep = false;  ///< the status follows when the sweep under way has ended
};

/// Kinds of a value on the wire.
enum class Kind { None, Number, Code, Text };

/// One word. A settable word without a setter of its own writes its member of the settings; a
/// queryable one without a getter reads it. Presets are those of `Settings`.
struct Word {
    std::string_view name;
    unsigned verbs;  ///< sum of Verb
    Kind kind;
    double low, high;  ///< range of a number or code in the wire's unit
    unsigned modes;    ///< bit n: allowed in mode n
    bool sweeps;       ///< a new value starts a new sweep
    double Settings::*number = nullptr;
    std::string Settings::*text = nullptr;
    int decimals = 0;  ///< places of the answer
    int (*set)(Device&, double) = nullptr;
    std::string (*get)(Device&) = nullptr;
    int (*act)(Device&, std::string_view) = nullptr;
};

std::span<const Word> words();
/// The row of a word, in either case; null for an unknown one.
const Word* findWord(std::string_view name);
/// Carries out one second line ("FREQ,1e9", "IDN?", "INIT").
Answer execute(Device& device, Verb verb, std::string_view line);

}  // namespace zelsim
