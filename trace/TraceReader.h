#pragma once
// One read cycle: settings, wait for the sweep, samples, conversion, file, graph.

#include <cstdint>

#include "forms/Forms.h"
#include "link/BinaryTrace.h"
#include "link/CommandExchange.h"
#include "link/InstrumentLink.h"
#include "link/RawTrace.h"
#include "link/ZELBas.h"
#include "model/ZEL3Variables.h"
#include "platform/Event.h"
#include "platform/Session.h"
#include "trace/GraphScaling.h"
#include "trace/PaceMonitor.h"
#include "trace/Sweep.h"
#include "trace/TraceConversion.h"
#include "trace/TraceOnGraph.h"

namespace zel {

/// Which settings a selective cycle reads again.
struct ReadAgain {
    bool freq = false;
    bool span = false;
    bool refLvl = false;
    bool range = false;
    bool detector = false;
};

class TraceReader {
  public:
    /// The sweep of `onGraph` becomes each that is drawn.
    TraceReader(Forms& forms, ZEL3Variables& mirror, const InstrumentLink& link,
                const TraceOnGraph& onGraph, PaceMonitor& pace, const Session& session);

    /// The full cycle. True in `success` when a trace was read and drawn, be it incomplete.
    void ReadSingleTrace(bool& success);
    /// The selective cycle: only the settings that are asked for, and those that are unsure.
    void ReadSingleTrace2(const ReadAgain& again, bool& success);
    /// The sweep of the last cycle, also where the link ended in the middle of its transfer and
    /// nothing was drawn; `wanted` is 0 when no transfer began.
    const Sweep& lastSweep() const { return last_; }
    /// The last sweep is incomplete, be it drawn or not.
    Event<const Sweep&> CutShort;

  private:
    enum class Step { Ok, Refused, LinkFailed, NoNumber };

    Step query(const char* word, double& field);
    Step queryCode(const char* word, std::uint8_t& field);
    Step queryDetector();
    Step queryFrequency();
    Step querySpan();
    Step askSettings();
    Step askAgain(const ReadAgain& again);
    Step wait();
    void begin();
    SweepAxis viewRange() const;
    bool ReadTraceData(double xFirst, double xLast);
    void takeSamples(const RawTrace& trace);
    void scaleAndConvert();
    void writeForm() const;
    void waterfallRow();
    void abortView(bool& success);
    /// A script's window has the flag for itself.
    bool recordsTraces() const { return panel_.RecordDataFlag && !panel_.isSpecMeas; }

    Forms& forms_;
    ControllerForm& panel_;
    ZEL3Variables& mirror_;
    Sweep& onGraph_;
    ZELBas& state_;
    CommandExchange& exchange_;
    BinaryTrace& binary_;
    TraceConversion& conversion_;
    GraphScaling& scaling_;
    PaceMonitor& pace_;
    Session session_;
    bool silenceToldHere_ = false;  ///< a failure of this cycle's line has a box of its own
    Sweep last_;
};

}  // namespace zel
