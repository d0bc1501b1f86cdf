#pragma once
// The samples of one binary transfer, with the count of those that really came.

#include <cstddef>
#include <vector>

namespace zel {

struct RawTrace {
    /// Whole numbers in the order of the wire, 301 or 602. A place whose sample did not come keeps
    /// what stood there before the transfer.
    std::vector<double> values;
    std::size_t wanted = 0;  ///< samples asked for; 0 when no transfer began
    /// Samples from the first on that came. 0 where less than a sample is missing: the place of
    /// the loss is unknown then, and no sample can be trusted.
    std::size_t came = 0;

    /// Every byte asked for came, the separators too.
    bool whole() const { return wanted > 0 && came == wanted; }
};

}  // namespace zel
