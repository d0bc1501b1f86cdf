#pragma once
// Reads the bytes of a binary transfer: knows where the status ends and the samples begin.

#include <cstddef>
#include <cstdint>
#include <string>

#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "forms/MainForm.h"
#include "link/ByteLink.h"
#include "link/ZELBas.h"
#include "platform/Clock.h"
#include "platform/Session.h"

namespace zel {

/// Puts `count` places at the head of the bytes, `byte` in the first and zeros in the others.
void PrependBytes(std::string& bytes, std::size_t count, char byte);

class BinaryReader {
  public:
    BinaryReader(Forms& forms, ZELBas& state, ByteLink& link, const Session& session);

    /// The checked entry to `ReadBinaryBytes`; reports a closed port.
    std::string ReadBinaryBuffer(std::int16_t length);
    /// The bytes after the status, at most `length`; fewer when the instrument stops. A refusal
    /// gives its digit and CR, two bytes; a silence of 5 s gives nothing.
    std::string ReadBinaryBytes(std::int16_t length);
    /// One timed read: what has come as soon as something has, else nothing.
    std::string ReadBinaryChunk(std::int16_t seconds);

  private:
    std::string takeTail(std::size_t missing);

    ControllerForm& panel_;
    MainForm& dialog_;
    ZELBas& state_;
    ByteLink& link_;
    Session session_;
    Stopwatch StopwatchB_;
    Stopwatch tail_;
};

}  // namespace zel
