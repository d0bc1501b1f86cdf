#pragma once
// The routines of the instrument's line in one bundle, from its bytes to its sweeps.

#include "link/AnswerReader.h"
#include "link/BinaryTrace.h"
#include "link/ByteLink.h"
#include "link/CommandExchange.h"
#include "link/ZELBas.h"

namespace zel {

/// For modules that need three of these or more; a copy stands for the same routines.
struct InstrumentLink {
    ZELBas& state;
    ByteLink& bytes;
    AnswerReader& reader;
    CommandExchange& exchange;
    BinaryTrace& binary;
};

}  // namespace zel
