#pragma once
// The instrument's line protocol over the device: bytes in, bytes out when they are due.

#include <cstddef>
#include <cstdint>
#include <deque>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "ZELSim/Device.h"
#include "ZELSim/Faults.h"
#include "ZELSim/HostLine.h"
#include "ZELSim/Words.h"

namespace zelsim {

struct WireSetup {
    int baud = 0;          ///< 10 bits a byte in both directions; 0: no time on the line
    double answering = 0;  ///< s that the instrument takes for each answer
    /// A host at another rate than the instrument's gets noise also where no time is on the line.
    bool strictBaud = false;
    /// An answer is handed out in one piece when its last byte is due (packets of a network).
    bool wholeAnswers = false;
    std::vector<FaultRule> faults = {};
};

class Wire : public HostLine {
  public:
    Wire(Device& device, const WireSetup& setup);

    void receive(std::string_view bytes) override;
    /// For the device too.
    void advance(double seconds) override;
    std::string take() override;
    std::optional<double> nextDue() const override;
    void reset() override;
    bool congested() const override;
    /// On a paced or strict line another rate than the instrument's makes noise of both
    /// directions.
    void setHostBaud(int baud) override { hostBaud_ = baud; }
    /// The rate of the instrument's port.
    int baud() const { return baud_; }

  private:
    struct Line {
        std::string text;
        double arrival = 0;
        bool tooLong = false;
    };
    struct Segment {
        std::string bytes;
        double start = 0;
        double perByte = 0;
        std::size_t taken = 0;
    };

    double now() const { return device_.now(); }
    double byteTime() const { return paced_ && baud_ > 0 ? 10.0 / baud_ : 0.0; }
    void run(double target);
    bool step(double target);
    void handle(const Line& line);
    void firstLine(const std::string& text);
    void secondLine(const std::string& text);
    void send(std::string bytes, double delay);
    void noise(std::string_view received);
    std::size_t arrived(const Segment& segment) const;

    Device& device_;
    int baud_;
    bool paced_;
    bool strict_;
    double answering_;
    int hostBaud_ = 0;
    bool whole_;
    FaultPlan faults_;

    Line partial_;
    std::deque<Line> lines_;
    double receiving_ = 0;      // until then the host's last byte is on the line
    std::optional<Verb> verb_;  // set between the two lines of an exchange
    bool waiting_ = false;      // for a sweep's end
    std::uint64_t awaitedSweep_ = 0;
    FaultPlan::Verdict waitVerdict_;

    std::deque<Segment> segments_;
    double sending_ = 0;  // until then the last answer is on the line
};

}  // namespace zelsim
