#pragma once
// Reading what is installed on the machine, a value at a time.

#include <cstdint>
#include <string>

#include "support/cRegistry.h"

namespace zel {

/// The text of a value, or the default. `registry` keeps its own key.
inline std::string readRegistryText(cRegistry registry, std::int32_t rootKey,
                                    const std::string& section, const std::string& value,
                                    const std::string& fallback) {
    registry.ClassKey = rootKey;
    registry.SectionKey = section;
    registry.ValueKey = value;
    registry.Default = fallback;
    return registry.Value();
}

}  // namespace zel
