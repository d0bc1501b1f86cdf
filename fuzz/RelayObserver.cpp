// Any bytes of a client, split anywhere: the word is seen wherever the splits are, and nothing is
// lost or joined on the way to the line.

#include <algorithm>
#include <cstdint>
#include <cstdlib>
#include <string>

#include "forms/ServerForm.h"
#include "platform/MessageBox.h"
#include "platform/virtual/MemoryServices.h"
#include "platform/virtual/RecordedBoxes.h"
#include "platform/virtual/ScriptedPort.h"
#include "platform/virtual/ScriptedSocket.h"
#include "platform/virtual/VirtualFiles.h"
#include "platform/virtual/VirtualTime.h"
#include "server/Relay.h"
#include "server/ReplyWatch.h"
#include "support/Text.h"

namespace {

/// The pieces into which the first bytes of the input cut the rest.
std::size_t pieceAt(const std::uint8_t* data, std::size_t size, std::size_t index) {
    return size == 0 ? 1 : 1 + data[index % size] % 13;
}

bool ends(const std::string& text, const std::string& word) {
    return text.find(word) != std::string::npos;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string bytes(reinterpret_cast<const char*>(data), size);
    // A word that stands in the last eight bytes of what came so far is always seen.
    zel::TraceWatch watch;
    std::string seen;
    for (std::size_t at = 0, turn = 0; at < bytes.size(); ++turn) {
        const std::string piece = bytes.substr(at, pieceAt(data, size, turn));
        at += piece.size();
        seen += zel::upperCase(piece);
        const bool trace = watch.take(piece);
        const std::size_t room = std::min(seen.size(), piece.size() + 7);
        if (ends(seen.substr(seen.size() - room), "TRACEBIN") && !trace) std::abort();
        if (trace && !ends(seen, "TRACEBIN")) std::abort();
    }

    // What is known of a reply does not depend on where its bytes and those of its question are
    // split, and a whole one has a CR for each status and for the text.
    zel::ReplyWatch whole;
    zel::ReplyWatch split;
    const std::size_t half = bytes.size() / 2;
    whole.asked(bytes.substr(0, half));
    for (const char c : bytes.substr(0, half)) split.asked(std::string(1, c));
    const std::string reply = bytes.substr(half);
    bool last = false;
    for (const char c : reply) last = split.answered(std::string(1, c));
    if (!reply.empty() && whole.answered(reply) != last) std::abort();
    if (last && reply.back() != '\r') std::abort();

    zel::VirtualClock clock;
    zel::VirtualEvents events(clock);
    zel::RecordedBoxes boxes;
    zel::VirtualFiles files(clock);
    zel::MemoryDebugChannel debug;
    zel::RootDebug log(clock, files, debug, "/app");
    zel::ServerForm form;
    zel::TextBox line(form, "line");
    zel::ScriptedPort port(events);
    zel::ScriptedSocket client(events);
    zel::Relay relay(form, port, client, {clock, events, boxes, line}, log);
    zel::SerialSetup setup;
    setup.CommPort = "COM1";
    port.open(setup);
    client.begin();
    std::string answered;
    for (std::size_t at = 0, turn = 0; at < bytes.size(); ++turn) {
        const std::string piece = bytes.substr(at, pieceAt(data, size, turn));
        at += piece.size();
        client.arrive(piece);
        port.arrive(piece);
        answered += piece;
        events.runFor(pieceAt(data, size, turn + 1));
    }
    events.runFor(200);
    if (port.written() != bytes || client.written() != answered) std::abort();
    if (relay.waiting() != 0) std::abort();
    return 0;
}
