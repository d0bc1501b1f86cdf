#pragma once
// The radio scene at the input: who transmits where, how strong, and how it moves in time.

#include <cstdint>
#include <vector>

namespace zelsim {

/// A GSM time slot and frame, in seconds.
inline constexpr double kSlotSeconds = 15.0 / 26.0 * 1e-3;
inline constexpr double kFrameSeconds = 8 * kSlotSeconds;

struct Emitter {
    enum class Kind {
        Carrier,   ///< steady
        Drifting,  ///< wanders `width` Hz to both sides, `rate` times a second
        Fm,        ///< deviates `width` Hz, modulated with `rate` Hz
        Burst,     ///< time slots of a GSM frame, `width` Hz deviation
        Band,      ///< noise-like, `width` Hz wide, `dbm` in all
    };
    Kind kind = Kind::Carrier;
    double hz = 0;
    double dbm = 0;
    double width = 0;
    double rate = 0;
};

/// What an emitter does from one moment on: the frequency and power at that moment, and the
/// bounds of both while the sweep stays at the point.
struct Activity {
    double hz, hzLow, hzHigh;
    double mw, mwLow, mwHigh, mwMean;
};

/// The same seed and time give the same activity.
class Scene {
  public:
    explicit Scene(std::uint64_t seed);
    const std::vector<Emitter>& emitters() const { return emitters_; }
    /// The emitter from `seconds` on, for `length` seconds.
    Activity at(const Emitter& emitter, double seconds, double length) const;
    /// Power of all emitters together at a moment, mW.
    double totalPower(double seconds) const;

  private:
    double burstGain(double seconds) const;
    double burstBit(double seconds) const;

    std::vector<Emitter> emitters_;
    double phase_;
    std::uint64_t seed_;
};

}  // namespace zelsim
