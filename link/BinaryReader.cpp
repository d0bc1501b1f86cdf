#include "link/BinaryReader.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <string>

#include "forms/Forms.h"
#include "link/ByteLink.h"
#include "link/ZELBas.h"
#include "platform/MessageBox.h"
#include "platform/Session.h"
#include "support/NumberText.h"

namespace zel {
namespace {

constexpr std::int16_t kChunkSeconds = 5;
constexpr int kStallMs = 5000;
constexpr int kPollMs = 20;
constexpr int kTailMs = 200;  // for the last bytes of a slow line
constexpr std::size_t kStatusBytes = 2;

/// A status digit but 0 and CR with nothing behind it.
bool isRefusal(const std::string& bytes) {
    return bytes.size() == kStatusBytes && bytes[1] == '\r' && bytes[0] >= '1' && bytes[0] <= '7';
}

}  // namespace

void PrependBytes(std::string& bytes, std::size_t count, char byte) {
    if (count == 0) return;
    std::string head(count, '\0');
    head.front() = byte;
    bytes.insert(0, head);
}

BinaryReader::BinaryReader(Forms& forms, ZELBas& state, ByteLink& link, const Session& session)
    : panel_(forms.controller),
      dialog_(forms.main),
      state_(state),
      link_(link),
      session_(session),
      StopwatchB_(session.clock),
      tail_(session.clock) {}

std::string BinaryReader::ReadBinaryBuffer(std::int16_t length) {
    std::string bytes;
    if (link_.usable()) {
        bytes = ReadBinaryBytes(length);
    } else if (link_.isTcp()) {
        link_.tellLoss();
    } else {
        session_.boxes.show({BoxIcon::Critical, "Port is not open!"});
    }
    session_.events.pump();
    session_.DebugLine("BIN-BUFFER-LEN: " + numberText(static_cast<double>(bytes.size()) - 1));
    return bytes;
}

std::string BinaryReader::ReadBinaryChunk(std::int16_t seconds) {
    StopwatchB_.Reset();
    std::string chunk = link_.takeBytes();
    while (chunk.empty() && StopwatchB_.Elapsed() <= seconds * 1000 && link_.usable()) {
        session_.events.wait(kPollMs);
        chunk = link_.takeBytes();
    }
    return chunk;
}

std::string BinaryReader::takeTail(std::size_t missing) {
    std::string tail;
    tail_.Reset();
    while (tail.size() < missing && tail_.Elapsed() <= kTailMs && link_.usable()) {
        session_.events.wait(kPollMs);
        tail += link_.takeBytes();
    }
    return tail;
}

std::string BinaryReader::ReadBinaryBytes(std::int16_t length) {
    const auto wanted = static_cast<std::size_t>(length);
    std::string result;
    const bool serialUsable = dialog_.IsConnectedToPort && link_.portOpen();
    if (!link_.isTcp() && !serialUsable) {
        if (!panel_.ErrorFlag) {
            session_.boxes.show({BoxIcon::Critical, "Not Connected To Port!"});
            panel_.ErrorFlag = true;
        }
        state_.TCPDataArrived = false;
        return result;
    }
    bool more = false;
    const auto cut = [&] {
        more = more || result.size() > wanted;
        if (more) result.resize(wanted);
    };
    std::string chunk = ReadBinaryChunk(kChunkSeconds);
    if (chunk.size() == 1) {
        const char status = chunk.front();
        chunk = ReadBinaryChunk(kChunkSeconds);
        PrependBytes(chunk, 1, status);
    }
    StopwatchB_.Reset();
    if (isRefusal(chunk)) {
        // A refusal has nothing after it: samples there show that the digit itself is wrong.
        session_.events.wait(kPollMs);
        const std::string behind = link_.takeBytes();
        if (behind.empty()) {
            state_.TCPDataArrived = false;
            return chunk;
        }
        chunk += behind;
    }
    if (!chunk.empty()) {
        // A line that pauses inside the status brings the rest of it before the samples.
        std::size_t ofStatus = kStatusBytes;
        for (;;) {
            const std::size_t passed = std::min(ofStatus, chunk.size());
            chunk.erase(0, passed);
            ofStatus -= passed;
            result += chunk;
            chunk = link_.takeBytes();
            if (chunk.empty() && result.size() + 3 < wanted) chunk = ReadBinaryChunk(kChunkSeconds);
            session_.events.pump();
            if (StopwatchB_.Elapsed() > kStallMs) break;
            if (result.size() + 2 >= wanted) break;
            if (chunk.empty() && !link_.usable()) break;
            if (chunk.empty()) session_.events.wait(kPollMs);
        }
        // The end of the block is near or the instrument has stopped: the chunk at hand and the
        // last bytes still belong to the samples.
        chunk.erase(0, std::min(ofStatus, chunk.size()));
        result += chunk;
        cut();
        if (result.size() + 2 >= wanted) result += takeTail(wanted - result.size());
        cut();
    }
    state_.TCPDataArrived = false;
    link_.noteBlock(result.size());
    // The rest of a transfer comes into the next exchange, as a late one does.
    if (more) state_.RestFound = true;
    if (more || result.size() < wanted) state_.AnswerOverdue = true;
    if (link_.isTcp() && result.size() < wanted && !link_.usable()) link_.tellLoss();
    return result;
}

}  // namespace zel
