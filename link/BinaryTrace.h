#pragma once
// The binary transfer of a sweep: TRACEBIN and CTRACEBIN, with their ways of asking again.

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include "forms/ControllerForm.h"
#include "link/AnswerReader.h"
#include "link/BinaryReader.h"
#include "link/ByteLink.h"
#include "link/LinkDelays.h"
#include "link/RawTrace.h"
#include "link/ZELBas.h"
#include "platform/Clock.h"
#include "platform/Session.h"

namespace zel {

/// A block is 301 samples and a separator byte, 1205 bytes; a double transfer is two of them. A
/// sample is a signed 32-bit integer, least significant byte first.
class BinaryTrace {
  public:
    static constexpr std::int16_t kSingleBytes = 1205;
    static constexpr std::int16_t kDoubleBytes = 2410;
    static constexpr std::size_t kSingleSamples = 301;
    static constexpr std::size_t kDoubleSamples = 602;

    BinaryTrace(ControllerForm& panel, ZELBas& state, ByteLink& link, AnswerReader& reader,
                BinaryReader& bytes, const Session& session);

    /// TRACEBIN: 301 or 602 raw samples. A transfer that stops leaves the tail of the values as it
    /// was and is a success all the same, with `came` below `wanted`; a refusal or a lost link is
    /// none.
    bool GetTraceBinary(RawTrace& trace, bool doubleBlock);
    /// CTRACEBIN: 602 raw samples, the level block and the phase block.
    bool GetCTraceBinary(std::vector<double>& values);
    /// Exactly `count` characters through the text path, asked for again every 10 s of silence;
    /// empty when the port is closed.
    std::string ReadLiteralBytes(std::int32_t count);

  private:
    /// What may end a round of asking again.
    struct Round {
        bool looping;
        bool recording;
        bool connected;
    };
    enum class Outcome { Done, Failed, AskAgain };

    Round beginRound() const;
    bool mayAskAgain(const Round& round) const;
    Outcome readOnce(RawTrace& trace, bool doubleBlock, bool& success);
    void decode(const std::string& bytes, bool doubleBlock, RawTrace& trace);
    Outcome readComplexOnce(std::vector<double>& values, bool& success);
    void delay(DelayPlace place);
    void startingError(int status, const char* keyword);

    ControllerForm& panel_;
    ZELBas& state_;
    ByteLink& link_;
    AnswerReader& reader_;
    BinaryReader& bytes_;
    Session session_;
    Stopwatch StopwatchA_;
};

}  // namespace zel
