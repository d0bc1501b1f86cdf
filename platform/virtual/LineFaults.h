#pragma once
// What can go wrong with the bytes of a line on their way to the program.

#include <optional>
#include <string>
#include <vector>

namespace zel {

/// Positions count the bytes delivered since the line was made, from 0. An absent position means
/// that this fault does not happen.
struct LineFaults {
    std::optional<long> dropAt = std::nullopt;    ///< the line dies before this byte
    std::optional<long> garbleAt = std::nullopt;  ///< this byte arrives with other bits
    std::optional<long> splitAt = std::nullopt;   ///< a pause lies before this byte
    int splitPauseMs = 100;
};

/// What a garbled byte becomes: a different byte, never CR.
char garbled(char byte);

/// A run of bytes as the faults leave it.
struct FaultyRun {
    struct Piece {
        std::string bytes;
        int pauseMs = 0;  ///< before the piece
    };
    std::vector<Piece> pieces;
    bool dies = false;  ///< the line dies after the last piece
};

/// Applies the faults to bytes that begin at the position `from`.
FaultyRun applyFaults(const LineFaults& faults, long from, const std::string& bytes);

}  // namespace zel
