#pragma once
// One serial port: opened by name, read and written without waiting.

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

#include "platform/Event.h"

namespace zel {

/// The port's settings, each under the name that the line's setup gives it.
struct SerialSetup {
    std::string CommPort;  ///< device name ("COM3", "/dev/ttyUSB0")
    bool DTREnable = true;
    bool RTSEnable = true;
    int Handshaking = 0;      ///< 0 none, 3 RTS and XON/XOFF
    int InBufferSize = 1024;  ///< bytes
    int OutBufferSize = 1024;
    int InputLen = 0;    ///< 0: a read takes all
    int RThreshold = 1;  ///< an event per received group
    int SThreshold = 0;
    std::string Settings;  ///< "57600,N,8,1"
};

/// `CommEvent` codes: 2 is data received, 1001 to 1011 are line errors.
class SerialPort {
  public:
    virtual ~SerialPort() = default;
    /// False when the port cannot be had; `problem` then says which port and why, for a user.
    virtual bool open(const SerialSetup& setup) = 0;
    virtual void close() = 0;
    /// False as well once the device has gone.
    virtual bool isOpen() const = 0;
    /// Takes all that has arrived; empty if nothing has.
    virtual std::string input() = 0;
    virtual void output(std::string_view bytes) = 0;
    virtual std::string problem() const = 0;
    /// Bytes of `output` that the line has not taken yet.
    virtual std::size_t bytesToWrite() const { return 0; }
    /// Runs inside the event pump with the CommEvent code.
    Event<int> OnComm;
};

/// The serial ports that the platform knows, in its order.
class SerialPortList {
  public:
    virtual ~SerialPortList() = default;
    virtual std::vector<std::string> names() = 0;
};

}  // namespace zel
