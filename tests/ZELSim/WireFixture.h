#pragma once
// A wire with a device behind it, spoken to as a host does.

#include <gtest/gtest.h>

#include <array>
#include <cstdint>
#include <cstdlib>
#include <string>
#include <string_view>
#include <vector>

#include "ZELSim/Device.h"
#include "ZELSim/Numbers.h"
#include "ZELSim/Wire.h"

namespace zelsim {

/// One block of samples: 301 little-endian 32-bit integers from `offset` on.
inline std::array<double, kPoints> decodeBlock(const std::string& bytes, std::size_t offset) {
    std::array<double, kPoints> values{};
    for (std::size_t i = 0; i < kPoints; ++i) {
        std::uint32_t bits = 0;
        for (unsigned byte = 0; byte < 4; ++byte) {
            const auto c = static_cast<unsigned char>(bytes.at(offset + 4 * i + byte));
            bits |= static_cast<std::uint32_t>(c) << (8 * byte);
        }
        values[i] = static_cast<std::int32_t>(bits);
    }
    return values;
}

struct Host {
    Device device;
    Wire wire;

    explicit Host(const DeviceSetup& deviceSetup = {}, const WireSetup& wireSetup = {})
        : device(deviceSetup), wire(device, wireSetup) {}

    /// Sends a line and takes what comes at once.
    std::string say(std::string_view line) {
        wire.receive(std::string(line) + "\r");
        return wire.take();
    }
    /// Both lines of an exchange; the answer to the second.
    std::string exchange(std::string_view verb, std::string_view line) {
        EXPECT_EQ(say(verb), "0\r");
        return say(line);
    }
    std::string cmd(std::string_view line) { return exchange("cmd", line); }
    std::string set(std::string_view line) { return exchange("set", line); }
    std::string get(std::string_view line) { return exchange("GET", line); }
    /// The value of a GET that is accepted.
    std::string value(std::string_view word) {
        const std::string answer = get(word);
        EXPECT_EQ(answer.substr(0, 2), "0\r") << word;
        EXPECT_EQ(answer.back(), '\r') << word;
        return answer.size() > 3 ? answer.substr(2, answer.size() - 3) : std::string();
    }
    double number(std::string_view word) { return parseNumber(value(word)).value_or(-1e99); }
    /// Sets in remote state, all accepted.
    void setUp(const std::vector<std::string>& settings) {
        EXPECT_EQ(cmd("REMOTE"), "0\r");
        for (const std::string& setting : settings) {
            EXPECT_EQ(set(setting), "0\r") << setting;
        }
    }
    /// Waits for the sweep and fetches the trace, without the status line.
    std::string sweep() {
        EXPECT_EQ(cmd("WAIT"), "");
        for (int i = 0; i < 1000; ++i) {
            wire.advance(wire.nextDue().value_or(1));
            if (wire.take() == "0\r") {
                break;
            }
        }
        const std::string answer = get("TRACEBIN");
        EXPECT_EQ(answer.substr(0, 2), "0\r");
        return answer.substr(2);
    }
    /// Trace of a detector other than auto peak, in thousandths of a dB.
    std::array<double, kPoints> levels() { return decodeBlock(sweep(), 0); }
};

inline double meanOf(const std::array<double, kPoints>& values) {
    double sum = 0;
    for (const double value : values) {
        sum += value;
    }
    return sum / static_cast<double>(kPoints);
}

}  // namespace zelsim
