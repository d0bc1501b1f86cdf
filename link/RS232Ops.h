#pragma once
// Serial port routines for the windows that open a port of their own.

#include <string>
#include <vector>

#include "platform/Events.h"
#include "platform/MessageBox.h"
#include "platform/SerialPort.h"

namespace zel {

class RS232Ops {
  public:
    RS232Ops(Events& events, MessageBoxes& boxes) : events_(events), boxes_(boxes) {}

    /// `portName` as the lists show it ("COM3", "/dev/ttyUSB0"), `baudText` led by the baud rate.
    bool OpenComPort(SerialPort& control, const std::string& portName, const std::string& baudText);
    /// 8 data bits, no parity, 1 stop bit. An open port is reported and left as it is.
    bool OpenComPortNumber(SerialPort& control, const std::string& port, long baud);
    /// The receive side of a data event with that CommEvent code: line errors and changes give
    /// nothing; data received waits 100 ms for its burst to complete.
    void ReadComPortEvent(std::string& result, SerialPort& control, int commEvent);
    void WriteComPort(SerialPort& control, const std::string& text) { control.output(text); }
    void CloseComPortControl(SerialPort& control) {
        if (control.isOpen()) control.close();
    }

  private:
    Events& events_;
    MessageBoxes& boxes_;
};

/// The names of the serial ports, added to the collection in the platform's order.
void ReadSerialPortNames(SerialPortList& ports, std::vector<std::string>& collection);

}  // namespace zel
