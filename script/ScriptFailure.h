#pragma once
// A failure inside a run that ends it; its text goes into a box.

#include <stdexcept>

namespace zel {

struct ScriptFailure : std::runtime_error {
    using std::runtime_error::runtime_error;
};

/// What a number beyond its bounds, or 0 divided by 0, is called.
inline constexpr const char* kOverflow = "Overflow";

}  // namespace zel
