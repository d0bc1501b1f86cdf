#pragma once
// Faults on purpose: lost and garbled bytes, late answers, silence, refusals.

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "ZELSim/Noise.h"

namespace zelsim {

struct FaultRule {
    enum class Kind { Drop, Delay, Garble, Silence, Refuse };
    Kind kind = Kind::Drop;
    std::uint64_t byte = 0;      ///< from 1, of the bytes that the instrument sends; 0: not by byte
    std::uint64_t exchange = 0;  ///< from 1; 0: not by exchange
    double probability = 0;      ///< of each byte or exchange
    std::string word;            ///< upper case; the second line's word
    std::uint64_t count = 0;     ///< so many bytes or exchanges at most
    double seconds = 1;          ///< of a delay
    int status = 4;              ///< of a refusal
    int step = 2;                ///< of delay and refusal: 1 the mode word's answer, 2 the second
};

/// Reads "KIND[:NAME=VALUE,...]". Nothing on a text that is none; `problem` then says why.
std::optional<FaultRule> parseFault(std::string_view text, std::string& problem);
/// The text of --help on faults.
std::string_view faultHelp();

class FaultPlan {
  public:
    struct Verdict {
        bool silent = false;
        double delay = 0;  ///< s
        std::optional<int> refusal;
    };

    FaultPlan(const std::vector<FaultRule>& rules, std::uint64_t seed);
    /// To be asked once for the first line of each exchange.
    Verdict beginExchange();
    /// To be asked for the second line, with its word.
    Verdict secondLine(std::string_view word);
    /// What becomes of bytes that are sent.
    void mangle(std::string& bytes);

  private:
    struct Armed {
        FaultRule rule;
        std::uint64_t hits = 0;
        bool applies = false;
    };
    bool spent(const Armed& armed) const;
    Verdict verdict(int step) const;

    std::vector<Armed> rules_;
    Random random_;
    std::uint64_t exchange_ = 0;
    std::uint64_t byte_ = 0;
};

}  // namespace zelsim
