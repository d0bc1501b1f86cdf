#pragma once
// The height of a division, be it a code of the instrument or decibels from a file.

#include <cmath>

#include "model/CodeTables.h"

namespace zel {

/// The instrument gives a RANGE code, a loaded file decibels a division (or the linear code).
class LevelRange {
  public:
    static LevelRange ofCode(double code) { return {code, true}; }
    static LevelRange ofDecibels(double perDivision) { return {perDivision, false}; }

    bool isCode() const { return isCode_; }
    /// dB; 10 for the linear codes.
    double perDivision() const {
        const double whole = std::nearbyint(number_);
        return isCode_ ? decibelsPerDivision(whole) : whole;
    }
    /// The RANGE code; decibels that no code has stay as they are.
    double code() const {
        if (isCode_ || number_ == RANGELIN) return number_;
        for (int code = RANGE10DB; code <= RANGE1DB; ++code)
            if (decibelsPerDivision(code) == number_) return code;
        return number_;
    }

  private:
    LevelRange(double number, bool isCode) : number_(number), isCode_(isCode) {}

    double number_;
    bool isCode_;
};

}  // namespace zel
