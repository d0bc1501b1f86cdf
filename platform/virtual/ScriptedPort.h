#pragma once
// A serial port whose far end is a script: it reads like a page of the protocol.
//
//     port.expect("GET\r").answer("0\r");
//     port.expect("FREQ\r").answer("0\r").answer("1500000000\r").after(20);

#include <cstddef>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "platform/Events.h"
#include "platform/SerialPort.h"
#include "platform/virtual/Dialogue.h"

namespace zel {

/// Bytes arrive inside a pump or a wait, never before. Output to a port that is not open is lost.
class ScriptedPort : public SerialPort {
  public:
    explicit ScriptedPort(Events& events);

    Dialogue& expect(std::string bytes) { return script_.expect(std::move(bytes)); }
    /// Bytes that come by themselves at the opening, or after the steps so far.
    Dialogue& noise(std::string bytes) { return script_.noise(std::move(bytes)); }
    Dialogue& script() { return script_; }

    /// The line dies when so many bytes were delivered.
    void dropAfterByte(long count) { script_.faults.dropAt = count; }
    /// The byte of that position, counted from 0, arrives with other bits.
    void garbleByte(long position) { script_.faults.garbleAt = position; }
    /// A pause lies before the byte of that position.
    void splitAtByte(long position, int pauseMs = 100);
    /// The next openings fail, `times` of them; `why` is what `problem` says.
    void failOpen(std::string why, int times = 1 << 30);
    /// What the line has not taken.
    void setBacklog(std::size_t bytes) { backlog_ = bytes; }
    /// Plugs the device out.
    void die();
    /// Bytes that arrive at once, as if the instrument sent them by itself.
    void arrive(const std::string& bytes);

    const std::string& failure() const { return script_.failure(); }
    std::string leftOver() const { return script_.leftOver(); }
    const std::string& written() const { return script_.written(); }
    /// The setups of all openings that were tried, in order.
    const std::vector<SerialSetup>& openings() const { return openings_; }
    /// What arrived and was not taken yet.
    const std::string& waiting() const { return waiting_; }

    bool open(const SerialSetup& setup) override;
    void close() override;
    bool isOpen() const override { return open_; }
    std::string input() override { return std::exchange(waiting_, {}); }
    void output(std::string_view bytes) override;
    std::string problem() const override { return problem_; }
    std::size_t bytesToWrite() const override { return backlog_; }

  private:
    Dialogue script_;
    std::vector<SerialSetup> openings_;
    std::string waiting_;
    std::string problem_;
    std::string openFailure_;
    int openFailures_ = 0;
    std::size_t backlog_ = 0;
    bool open_ = false;
};

}  // namespace zel
