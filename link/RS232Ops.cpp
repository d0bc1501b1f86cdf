#include "link/RS232Ops.h"

#include <string>
#include <utility>
#include <vector>

#include "link/ByteLink.h"
#include "platform/MessageBox.h"
#include "platform/SerialPort.h"
#include "support/NumberText.h"

namespace zel {
namespace {

constexpr int kDataReceived = 2;
constexpr int kBurstMs = 100;
constexpr int kServerInBuffer = 4096;
constexpr int kServerOutBuffer = 2048;

}  // namespace

bool RS232Ops::OpenComPort(SerialPort& control, const std::string& portName,
                           const std::string& baudText) {
    const double baud = leadingNumber(baudText);
    if (baud < 1 || baud > 1e7) return false;
    std::string device = serialDeviceName(portName, {});
    if (device.empty()) device = portName;  // a name of the platform's own
    return OpenComPortNumber(control, device, static_cast<long>(baud));
}

bool RS232Ops::OpenComPortNumber(SerialPort& control, const std::string& port, long baud) {
    if (control.isOpen()) {
        boxes_.show({BoxIcon::Critical, "Port already opened!"});
        return false;
    }
    SerialSetup setup;
    setup.CommPort = port;
    setup.InBufferSize = kServerInBuffer;
    setup.OutBufferSize = kServerOutBuffer;
    setup.SThreshold = 1;
    setup.Settings = std::to_string(baud) + ",N,8,1";
    return control.open(setup);
}

void RS232Ops::ReadComPortEvent(std::string& result, SerialPort& control, int commEvent) {
    result.clear();
    if (!control.isOpen()) {
        boxes_.show({BoxIcon::Critical, "Not Connected To Port!"});
        return;
    }
    if (commEvent != kDataReceived) return;
    events_.sleep(kBurstMs);
    result = control.input();
}

void ReadSerialPortNames(SerialPortList& ports, std::vector<std::string>& collection) {
    for (std::string& name : ports.names()) collection.push_back(std::move(name));
}

}  // namespace zel
