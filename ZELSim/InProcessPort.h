#pragma once
// A serial port with the simulated instrument behind it, in the program's own process and time.

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include "ZELSim/Device.h"
#include "ZELSim/HostLine.h"
#include "ZELSim/Modem.h"
#include "ZELSim/Phonebook.h"
#include "ZELSim/Wire.h"
#include "platform/Clock.h"
#include "platform/Events.h"
#include "platform/SerialPort.h"

namespace zelsim {

class InProcessPort : public zel::SerialPort {
  public:
    InProcessPort(const zel::Clock& clock, zel::Events& events, const DeviceSetup& device = {},
                  const WireSetup& wire = {});
    ~InProcessPort() override;
    InProcessPort(const InProcessPort&) = delete;
    InProcessPort& operator=(const InProcessPort&) = delete;

    /// The port of this name has a modem with the standard phonebook before the instrument.
    static constexpr const char* kModemPort = "/dev/modem";

    /// Any other name reaches the instrument. On a paced line the baud rate of the setup has to fit
    /// the instrument's, else only noise comes.
    bool open(const zel::SerialSetup& setup) override;
    void close() override;
    bool isOpen() const override { return open_; }
    std::string input() override;
    void output(std::string_view bytes) override;
    std::string problem() const override { return {}; }

    Device& device() { return device_; }

  private:
    void catchUp();
    void watch();
    void wake();

    const zel::Clock& clock_;
    zel::Events& events_;
    Device device_;
    Wire wire_;
    Modem modem_{wire_, Phonebook::standard()};
    HostLine* line_ = &wire_;
    bool open_ = false;
    std::int64_t seen_;  // microseconds of the clock up to which the wire's time has run
    std::string waiting_;
    std::optional<zel::TaskId> task_;
};

}  // namespace zelsim
