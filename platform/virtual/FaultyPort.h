#pragma once
// A serial port in front of another one that drops, garbles or splits what comes back.

#include <string>
#include <string_view>

#include "platform/Events.h"
#include "platform/SerialPort.h"
#include "platform/virtual/LineFaults.h"

namespace zel {

/// The faults count the bytes received since `arm`. A line that died stays dead until it is
/// opened again, and is then good.
class FaultyPort : public SerialPort {
  public:
    FaultyPort(SerialPort& inner, Events& events);
    ~FaultyPort() override;

    /// Takes these faults from the next byte on.
    void arm(const LineFaults& faults);
    void disarm() { arm({}); }
    /// Bytes received since `arm`, whether they were passed on or not.
    long received() const { return received_; }

    bool open(const SerialSetup& setup) override;
    void close() override;
    bool isOpen() const override { return !dead_ && inner_.isOpen(); }
    std::string input() override;
    void output(std::string_view bytes) override;
    std::string problem() const override { return dead_ ? "The port has gone." : inner_.problem(); }

  private:
    void take();
    void die();

    SerialPort& inner_;
    Events& events_;
    LineFaults faults_;
    long received_ = 0;
    bool dead_ = false;
    bool held_ = false;  ///< a split is under way
    bool diesBehind_ = false;
    TaskId release_ = 0;
    std::string waiting_;
    std::string behind_;
};

}  // namespace zel
