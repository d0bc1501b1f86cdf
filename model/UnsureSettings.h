#pragma once
// Which of the settings that the axes rest on the instrument may not have, though the mirror does.

#include <array>
#include <cstddef>
#include <string_view>

#include "platform/Event.h"

namespace zel {

enum class AxisSetting : std::size_t { Frequency, Span, ReferenceLevel, Range, Detector };

/// A setting is unsure after the instrument refused a value, or gave no answer to it, and the
/// mirror took the value all the same. The words are FREQ, SPAN, REFLVL, RANGE and TRACEDET; any
/// other word is passed over.
class UnsureSettings {
  public:
    bool has(AxisSetting setting) const { return unsure_.at(static_cast<std::size_t>(setting)); }
    bool any() const;
    /// A value of this word was sent and the mirror took it.
    void sent(std::string_view word, bool accepted) { set(word, !accepted); }
    /// The instrument answered a query of this word. False for an answer that is no number: the
    /// mirror keeps what it has, and the setting is unsure.
    bool answered(std::string_view word, std::string_view answer);
    /// The mirror holds what the instrument answered.
    void known(std::string_view word) { set(word, false); }
    /// The mirror holds the instrument's settings: a new session, a preset.
    void clear();

    Event<> Changed;

  private:
    void set(std::string_view word, bool unsure);

    std::array<bool, 5> unsure_{};
};

}  // namespace zel
