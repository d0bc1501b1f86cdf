#include "desktop/platform/QtSerialPort.h"

#include <poll.h>
#include <sys/ioctl.h>
#include <termios.h>
#include <unistd.h>

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QSerialPortInfo>
#include <algorithm>
#include <array>
#include <cstddef>
#include <string>
#include <string_view>
#include <tuple>
#include <vector>

#include "platform/SerialPort.h"

namespace zel {
namespace {

constexpr qint64 kMostBuffered = 1 << 20;  // bytes that nobody takes
constexpr int kDataReceived = 2;
constexpr int kWriteMs = 10'000;
constexpr int kDrainMs = 250;
constexpr int kDrainStepMs = 5;

/// Adds XON/XOFF to the lines RTS and CTS; a port that cannot do both stays at these.
void addSoftwareControl(int descriptor) {
    termios settings{};
    if (::tcgetattr(descriptor, &settings) != 0) return;
    settings.c_iflag |= IXON | IXOFF;
    ::tcsetattr(descriptor, TCSANOW, &settings);
}

/// "COM3" is the third port of the mainboard here; any other name stands for itself.
QString deviceOf(const std::string& name) {
    QString text = QString::fromStdString(name);
#ifndef Q_OS_WIN
    if (text.startsWith("COM")) {
        bool number = false;
        const int port = text.mid(3).toInt(&number);
        if (number && port > 0) return QString("/dev/ttyS%1").arg(port - 1);
    }
#endif
    // The toolkit takes a path that begins at the working folder for a name below /dev.
    return text.contains('/') ? QFileInfo(text).absoluteFilePath() : text;
}

/// The ports that the kernel lists: each terminal with a device under it, and radio links. Asking
/// the device manager for the same takes thousands of system calls, more than all else at start.
/// False where there is no such list.
bool portsOfSystem(const QString& folder, std::vector<std::string>& ports) {
    const QDir terminals(folder);
    if (!terminals.exists()) return false;
    QStringList names;
    for (const QString& name : terminals.entryList(QDir::AllEntries | QDir::System)) {
        const QString entry = terminals.filePath(name);
        if (!QFileInfo::exists(entry + "/device") && !name.startsWith("rfcomm")) continue;
        // A serial port of the board that has no chip has type 0.
        QFile type(entry + "/type");
        if (type.open(QIODevice::ReadOnly) && type.readAll().trimmed() == "0") continue;
        names << name;
    }
    std::sort(names.begin(), names.end(), [](const QString& one, const QString& other) {
        // Adapters stand before the ports of the board, ttyUSB2 before ttyUSB10.
        const auto key = [](const QString& name) {
            return std::make_tuple(name.startsWith("ttyS"), name.size(), name);
        };
        return key(one) < key(other);
    });
    for (const QString& name : names) ports.push_back("/dev/" + name.toStdString());
    return true;
}

}  // namespace

QtSerialPort::QtSerialPort(QtEvents& events, bool quick) : events_(events) {
    port_.setReadBufferSize(kMostBuffered);
    QObject::connect(&port_, &QSerialPort::readyRead, &port_, [this] {
        events_.bytesArrived(source_);
        OnComm(kDataReceived);
    });
    QObject::connect(&port_, &QSerialPort::errorOccurred, &port_,
                     [this](QSerialPort::SerialPortError error) {
                         // A time-out is none, and pseudo terminals have no control lines.
                         if (error == QSerialPort::ResourceError ||
                             error == QSerialPort::ReadError || error == QSerialPort::WriteError)
                             lost();
                     });
    writing_.setSingleShot(true);
    writing_.setInterval(kWriteMs);
    QObject::connect(&port_, &QSerialPort::bytesWritten, &writing_,
                     [this] { port_.bytesToWrite() > 0 ? writing_.start() : writing_.stop(); });
    QObject::connect(&writing_, &QTimer::timeout, &writing_, [this] {
        if (port_.isOpen()) port_.clear(QSerialPort::Output);
    });
    if (!quick) return;
    source_ = events_.addSource(
        {[this] { return port_.isOpen() ? static_cast<int>(port_.handle()) : -1; },
         [this] { return port_.isOpen() && port_.bytesAvailable() > 0; }});
}

QtSerialPort::~QtSerialPort() {
    if (source_ != 0) events_.removeSource(source_);
    port_.disconnect();
}

std::string QtSerialPort::openProblem() const {
    if (name_.empty()) return "No serial port is chosen. Choose one or type the name of a device.";
    // A name without a folder is one of the devices.
    const std::string path = name_.front() == '/' ? name_ : "/dev/" + name_;
    if (!QFileInfo::exists(QString::fromStdString(path)))
        return name_ + " is not there. Check the cable and the name of the port.";
    if (::access(path.c_str(), R_OK | W_OK) != 0)
        return "No rights to use " + name_ +
               ". Add yourself to the group \"dialout\" and log in again.";
    if (port_.error() == QSerialPort::PermissionError)
        return name_ + " is held by another program. Close it there and try again.";
    return name_ + ": " + port_.errorString().toStdString();
}

bool QtSerialPort::open(const SerialSetup& setup) {
    const QString device = deviceOf(setup.CommPort);
    name_ = device.toStdString();
    problem_.clear();
    port_.setPortName(device);
    bool isNumber = false;
    const int baud = QString::fromStdString(setup.Settings).section(',', 0, 0).toInt(&isNumber);
    if (!port_.open(QIODevice::ReadWrite)) {
        problem_ = openProblem();
        return false;
    }
    port_.setDataBits(QSerialPort::Data8);
    port_.setParity(QSerialPort::NoParity);
    port_.setStopBits(QSerialPort::OneStop);
    port_.setFlowControl(setup.Handshaking == 0 ? QSerialPort::NoFlowControl
                                                : QSerialPort::HardwareControl);
    if (setup.Handshaking != 0) addSoftwareControl(static_cast<int>(port_.handle()));
    if (!isNumber || !port_.setBaudRate(baud)) {
        port_.close();
        problem_ = name_ + " does not take the baud rate " + setup.Settings.substr(0, 20) + ".";
        return false;
    }
    // What is left of an earlier session, which may have ended in the middle of a transfer.
    port_.clear(QSerialPort::Input);
    port_.setDataTerminalReady(setup.DTREnable);
    if (setup.Handshaking == 0) port_.setRequestToSend(setup.RTSEnable);
    port_.clearError();
    return true;
}

void QtSerialPort::close() {
    problem_.clear();
    writing_.stop();
    if (!port_.isOpen()) return;
    letDrain();
    port_.close();
}

// A line that is held up would keep the system in the close for half a minute.
void QtSerialPort::letDrain() const {
    const auto descriptor = static_cast<int>(port_.handle());
    int waiting = 0;
    for (int ms = 0; ms < kDrainMs; ms += kDrainStepMs) {
        if (::ioctl(descriptor, TIOCOUTQ, &waiting) != 0 || waiting == 0) return;
        ::usleep(kDrainStepMs * 1000);
    }
    ::tcflush(descriptor, TCOFLUSH);
}

void QtSerialPort::lost() {
    if (!port_.isOpen()) return;
    if (!hungUp()) {
        // The loop came to read what `input` has taken already. It goes on listening.
        port_.clearError();
        port_.setReadBufferSize(kMostBuffered);
        return;
    }
    problem_ = name_ + " has gone. Check the cable, then disconnect and connect again.";
    port_.close();
}

bool QtSerialPort::hungUp() const {
    pollfd descriptor{static_cast<int>(port_.handle()), POLLIN, 0};
    return ::poll(&descriptor, 1, 0) > 0 &&
           (descriptor.revents & (POLLHUP | POLLERR | POLLNVAL)) != 0;
}

std::string QtSerialPort::input() {
    if (!port_.isOpen()) return {};
    events_.bytesTaken();
    // What the event loop has fetched comes first; what the line has now, without the detour
    // through the loop, after it.
    std::string bytes;
    if (port_.bytesAvailable() > 0) bytes = port_.readAll().toStdString();
    std::array<char, 4096> room{};
    ssize_t count = 0;
    do {
        count = ::read(static_cast<int>(port_.handle()), room.data(), room.size());
        if (count > 0) bytes.append(room.data(), static_cast<std::size_t>(count));
    } while (count == static_cast<ssize_t>(room.size()) && bytes.size() < kMostBuffered);
    return bytes;
}

void QtSerialPort::output(std::string_view bytes) {
    if (!port_.isOpen()) return;
    // A short line goes out at once; what the line does not take now is left to the event loop.
    if (port_.bytesToWrite() == 0) {
        const ssize_t count = ::write(static_cast<int>(port_.handle()), bytes.data(), bytes.size());
        if (count > 0) bytes.remove_prefix(static_cast<std::size_t>(count));
    }
    if (bytes.empty()) return;
    port_.write(bytes.data(), static_cast<qint64>(bytes.size()));
    port_.flush();
    if (port_.bytesToWrite() > 0 && !writing_.isActive()) writing_.start();
}

std::vector<std::string> QtSerialPortList::names() {
    if (std::vector<std::string> known; portsOfSystem(folder_, known)) return known;
    std::vector<std::string> names;
    for (const QSerialPortInfo& info : QSerialPortInfo::availablePorts())
        names.push_back(info.systemLocation().toStdString());
    return names;
}

}  // namespace zel
