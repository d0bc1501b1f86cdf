#pragma once
// The traces that the host keeps beside the live one: holds, averages, references.

#include <array>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>

#include "analysis/Hold.h"
#include "analysis/SpectrumTrace.h"

namespace zel {

inline constexpr std::size_t kHolds = 4;
inline constexpr std::size_t kMemories = 3;

/// The holds in the order of `HoldKind`: max, min, average of the levels, average of the power.
class HostTraces {
  public:
    /// Takes a sweep. Where frequency, span, unit or the kind of axis differ from those of the
    /// sweep before, all holds begin again and `ended` says so.
    void take(const SpectrumTrace& sweep);
    /// Another mode of the instrument: what was held is not comparable any more.
    void endBecause(const std::string& what);

    void switchOn(HoldKind kind, bool on);
    bool isOn(HoldKind kind) const { return on_.at(index(kind)); }
    void clear(HoldKind kind) { hold(kind).clear(); }
    /// Empty until a sweep came after it was switched on.
    SpectrumTrace held(HoldKind kind) const;
    std::uint64_t count(HoldKind kind) const { return holds_.at(index(kind)).count(); }

    /// Keeps a trace as the reference `place` (0 to 2).
    void remember(std::size_t place, const SpectrumTrace& trace) { memories_.at(place) = trace; }
    void forget(std::size_t place) { memories_.at(place).reset(); }
    const std::optional<SpectrumTrace>& memory(std::size_t place) const {
        return memories_.at(place);
    }
    /// The sweep less the reference, dB, sample by sample; nothing where the reference is empty or
    /// has other axes.
    std::optional<SpectrumTrace> normalised(const SpectrumTrace& sweep, std::size_t place) const;

    const std::optional<SpectrumTrace>& current() const { return current_; }
    /// Why the holds began again: "Held traces ended: span changed"; empty while they go on.
    const std::string& ended() const { return ended_; }
    void acknowledge() { ended_.clear(); }

  private:
    static std::size_t index(HoldKind kind) { return static_cast<std::size_t>(kind); }
    Hold& hold(HoldKind kind) { return holds_.at(index(kind)); }

    std::array<Hold, kHolds> holds_{Hold(HoldKind::Max), Hold(HoldKind::Min),
                                    Hold(HoldKind::Average), Hold(HoldKind::PowerAverage)};
    std::array<bool, kHolds> on_{};
    std::array<std::optional<SpectrumTrace>, kMemories> memories_;
    std::optional<SpectrumTrace> current_;
    std::string ended_;
};

}  // namespace zel
