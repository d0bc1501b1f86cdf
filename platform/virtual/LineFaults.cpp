#include "platform/virtual/LineFaults.h"

#include <cstddef>
#include <optional>
#include <string>

namespace zel {

char garbled(char byte) {
    const char other = static_cast<char>(static_cast<unsigned char>(byte) ^ 0x55U);
    return other == '\r' ? '?' : other;
}

FaultyRun applyFaults(const LineFaults& faults, long from, const std::string& bytes) {
    FaultyRun run;
    std::string all = bytes;
    const long end = from + static_cast<long>(all.size());
    const auto within = [&](const std::optional<long>& at) {
        return at && *at >= from && *at < end;
    };
    if (within(faults.garbleAt)) {
        char& byte = all[static_cast<std::size_t>(*faults.garbleAt - from)];
        byte = garbled(byte);
    }
    if (faults.dropAt && *faults.dropAt < end) {
        run.dies = true;
        all.resize(static_cast<std::size_t>(*faults.dropAt > from ? *faults.dropAt - from : 0));
    }
    if (within(faults.splitAt)) {
        const auto at = static_cast<std::size_t>(*faults.splitAt - from);
        if (at < all.size()) {
            if (at > 0) run.pieces.push_back({all.substr(0, at), 0});
            run.pieces.push_back({all.substr(at), faults.splitPauseMs});
            return run;
        }
    }
    if (!all.empty()) run.pieces.push_back({all, 0});
    return run;
}

}  // namespace zel
