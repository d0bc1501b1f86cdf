// Any bytes as a modem's answers: the dial comes to its end, the port is closed, and a call stands
// only when the answer has no word of a failed one.

#include <algorithm>
#include <cstdint>
#include <cstdlib>
#include <functional>
#include <string>

#include "connection/Dialling.h"
#include "platform/virtual/VirtualPlatform.h"
#include "shell/Program.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string bytes(reinterpret_cast<const char*>(data), std::min<std::size_t>(size, 8192));
    const std::string answer = zel::callAnswer(bytes, "ATDT5551234\r");
    if (answer.size() > bytes.size()) std::abort();
    if (zel::callProblem(bytes) == nullptr && bytes.find("BUSY") != std::string::npos) std::abort();

    zel::VirtualPlatform platform;
    zel::Program program(platform.bundle(), "");
    program.start();
    // The bytes come a piece at a time.
    std::size_t at = 0;
    const int pause = size == 0 ? 50 : 1 + data[0];
    const std::size_t piece = size < 2 ? 1 : 1 + data[1] % 64;
    std::function<void()> feed = [&] {
        if (platform.port.isOpen() && at < bytes.size()) {
            platform.port.arrive(bytes.substr(at, piece));
            at += piece;
        }
        if (at < bytes.size()) platform.events.schedule(pause, feed);
    };
    platform.events.schedule(pause, feed);
    program.connect({zel::LinkAddress::Kind::TwoModems, "COM1", 57600, "5551234"}, false);
    const bool connected = program.forms().controller.isConnected;
    if (!connected && platform.port.isOpen()) std::abort();
    if (!connected && platform.boxes.texts().empty()) std::abort();
    program.disconnect();
    if (platform.port.isOpen()) std::abort();
    return 0;
}
