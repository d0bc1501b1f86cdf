#pragma once
// What the statements work with, in two bundles: the instrument's line, the panel's routines.

#include "files/FileOps.h"
#include "files/Recording.h"
#include "files/ViewReader.h"
#include "link/AnswerReader.h"
#include "link/BinaryTrace.h"
#include "link/ByteLink.h"
#include "link/CommandExchange.h"
#include "link/ZELBas.h"
#include "model/ZEL3Variables.h"
#include "trace/TraceReader.h"

namespace zel {

struct InstrumentLine {
    ZEL3Variables& mirror;
    ZELBas& state;
    ByteLink& link;
    AnswerReader& reader;
    CommandExchange& exchange;
    BinaryTrace& binary;
};

struct PanelRoutines {
    TraceReader& traces;
    Recording& recording;
    ViewReader& reader;
    FileOps& files;
};

}  // namespace zel
