#include "connection/Devices.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <utility>
#include <vector>

#include "forms/Forms.h"
#include "link/ByteLink.h"
#include "link/RS232Ops.h"
#include "platform/Clock.h"
#include "platform/Files.h"
#include "platform/MessageBox.h"
#include "platform/ModalForm.h"
#include "platform/Pointer.h"
#include "platform/SerialPort.h"
#include "platform/Session.h"
#include "support/FileText.h"
#include "support/IniFile.h"
#include "support/NumberText.h"
#include "support/StringOp.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr const char* kFile = "/settings.ini";
constexpr const char* kListSection = "DEVICES";
constexpr std::uint64_t kLongestFile = 1U << 20;  // bytes
constexpr int kMostEntries = 10'000;
constexpr int kBuffer = 1024;  // bytes
constexpr int kBothKinds = 3;  // RTS and XON/XOFF
constexpr int kSettleMs = 1000;
constexpr int kBehindCommandMs = 50;
constexpr int kAnswerMs = 15'000;
constexpr int kNetAnswerMs = 20'000;  // the phone's net has to agree
constexpr int kPollMs = 20;
constexpr std::size_t kLongestAnswer = 4096;
constexpr double kFastestBaud = 10'000'000;
constexpr const char* kBauds[] = {"1200", "2400", "9600", "19200", "38400", "57600", "115200"};
constexpr const char* kWithoutAnswer[] = {"AT&W", "ATQ1", "AT&W0", "AT&W1"};

/// The value of "INIT" and the number; "1" where there is none, which ends a list.
std::string entry(const IniFile& file, const std::string& section, int number) {
    return file.rawValue(section, "INIT" + std::to_string(number)).value_or("1");
}

}  // namespace

Devices::Devices(Forms& forms, SerialPort& ZELCommC, SerialPortList& ports, const Store& store,
                 const Session& session)
    : panel_(forms.controller),
      form_(forms.devicesChoice),
      port_(ZELCommC),
      ports_(ports),
      store_(store),
      clock_(session.clock),
      events_(session.events),
      boxes_(session.boxes) {
    handlers_.on(form_.Load, [this] { Form_Load(); });
    handlers_.on(panel_.SetDevice.Clicked, [this] { SetDevice_Click(); });
    handlers_.on(form_.SetDeviceButton.Clicked, [this] { SetCommunicationDevice(); });
    handlers_.on(form_.CloseDevicesButton.Clicked, [this] { close(); });
    handlers_.on(form_.QueryUnload, [this](int&) { cancelled_ = true; });
}

/// Empty where there is no file; one that cannot be read is reported and counts as empty.
IniFile Devices::settings() const {
    const std::string path = store_.folder.path() + kFile;
    if (!store_.files.stat(path).exists()) return {};
    FileProblem problem;
    const auto bytes = readFile(store_.files, path, kLongestFile, problem);
    if (bytes) return IniFile::parse(bytesToUtf8(*bytes));
    boxes_.show({BoxIcon::Warning, readProblem(path, problem)});
    return {};
}

std::vector<std::string> Devices::ReadCommunicationDevices() {
    panel_.MousePointer = kHourglass;
    std::vector<std::string> names;
    const IniFile file = settings();
    for (int n = 1; n <= kMostEntries; ++n) {
        const std::string name = entry(file, kListSection, n);
        if (leadingNumber(name) == 1) break;
        names.push_back(name);
    }
    panel_.MousePointer = kArrow;
    if (names.empty()) names.emplace_back("NONE");
    return names;
}

void Devices::Form_Load() {
    if (form_.DevicesPortList.ListCount() == 0) {
        std::vector<std::string> names;
        ReadSerialPortNames(ports_, names);
        form_.DevicesPortList.setItems(std::move(names));
        form_.DevicesPortList.setListIndex(0);
    }
    if (form_.DevicesBaudList.ListCount() == 0) {
        for (const char* baud : kBauds) form_.DevicesBaudList.AddItem(baud);
        form_.DevicesBaudList.setListIndex(0);
    }
}

void Devices::SetDevice_Click() {
    if (form_.AvailableDevicesChoice.ListCount() == 0) {
        form_.AvailableDevicesChoice.setItems(ReadCommunicationDevices());
        form_.AvailableDevicesChoice.setListIndex(0);
    }
    showModalForm(form_, events_);
}

void Devices::close() {
    cancelled_ = true;
    form_.Hide();
}

bool Devices::openPort() {
    const std::string device =
        serialDeviceName(form_.DevicesPortList.Text(), form_.DevicesPortList.items());
    if (device.empty()) {
        boxes_.show({BoxIcon::Plain, "Please enter a valid COM port!"});
        return false;
    }
    const std::string baudText = trimmed(form_.DevicesBaudList.Text());
    const double baud = leadingNumber(baudText);
    if (!IsNumericText(baudText) || baud < 1 || baud > kFastestBaud) {
        boxes_.show({BoxIcon::Plain, "Please enter a valid baud rate!"});
        return false;
    }
    if (port_.isOpen()) {
        boxes_.show({BoxIcon::Critical, "Port already opened!"});
        return false;
    }
    SerialSetup setup;
    setup.CommPort = device;
    setup.Handshaking = kBothKinds;
    setup.InBufferSize = kBuffer;
    setup.OutBufferSize = kBuffer;
    setup.SThreshold = 1;
    setup.Settings = std::to_string(static_cast<long>(baud)) + ",N,8,1";
    if (port_.open(setup)) return true;
    std::string text = "Could not connect to the specified port!";
    if (!port_.problem().empty()) text += kCrLf + port_.problem();
    boxes_.show({BoxIcon::Warning, text});
    return false;
}

bool Devices::SetCommunicationDevice() {
    if (form_.Configuring) return false;
    panel_.ErrorFlag = false;
    if (!openPort()) return false;
    cancelled_ = false;
    form_.Configuring = true;
    form_.SetDeviceButton.Enabled = false;
    form_.MousePointer = kHourglass;
    bool ok = false;
    ConfigureDevice(ok);
    form_.MousePointer = kArrow;
    form_.SetDeviceButton.Enabled = true;
    form_.Configuring = false;
    form_.DeviceStatusLabel.Caption = "";
    port_.close();
    if (ok) boxes_.show({BoxIcon::Information, "Device configured."});
    return ok;
}

void Devices::ConfigureDevice(bool& ok) {
    ok = false;
    events_.pump();
    const Stopwatch settling(clock_);
    while (settling.Elapsed() < kSettleMs && !cancelled_)
        events_.wait(kSettleMs - settling.Elapsed());
    const IniFile file = settings();
    for (int n = 1; n <= kMostEntries && !cancelled_; ++n) {
        const std::string command = entry(file, form_.AvailableDevicesChoice.Text(), n);
        if (leadingNumber(command) == 1) {
            ok = true;
            return;
        }
        form_.DeviceStatusLabel.Caption = command;
        if (!sendCommand(command)) return;
    }
}

bool Devices::sendCommand(const std::string& command) {
    port_.output(command + "\r");
    events_.sleep(kBehindCommandMs);
    for (const char* silent : kWithoutAnswer)
        if (command == silent) return true;
    const int limit = startsWith(command, "AT+CGATT") ? kNetAnswerMs : kAnswerMs;
    std::string answer;
    const Stopwatch watch(clock_);
    while (!cancelled_) {
        if (!port_.isOpen()) {
            if (!panel_.ErrorFlag) boxes_.show({BoxIcon::Critical, "Port is not open!"});
            panel_.ErrorFlag = true;
            return false;
        }
        answer += port_.input();
        if (answer.size() > kLongestAnswer) answer.erase(0, kLongestAnswer / 2);
        if (answer.find("OK") != std::string::npos) return true;
        if (watch.Elapsed() > limit) break;
        events_.wait(kPollMs);
    }
    if (cancelled_) return false;
    std::string text = "No device found at this port!";
    if (!answer.empty()) text += std::string(kCrLf) + "CODE:" + kCrLf + bytesToUtf8(answer);
    boxes_.show({BoxIcon::Critical, text});
    return false;
}

}  // namespace zel
