#pragma once
// How a program ends.

namespace zel {

enum ExitStatus : int {
    kDone = 0,
    kLinkFailed = 1,  ///< the instrument, the link or the output failed
    kWrongUse = 2,
};

}  // namespace zel
