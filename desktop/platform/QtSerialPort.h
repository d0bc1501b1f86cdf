#pragma once
// A serial port of the computer.

#include <QByteArray>
#include <QSerialPort>
#include <QString>
#include <QTimer>
#include <cstddef>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "desktop/platform/QtEvents.h"
#include "platform/SerialPort.h"

namespace zel {

class QtSerialPort : public SerialPort {
  public:
    /// A `quick` port wakes a wait on the short way, for loops that take the bytes themselves.
    explicit QtSerialPort(QtEvents& events, bool quick = true);
    ~QtSerialPort() override;

    bool open(const SerialSetup& setup) override;
    void close() override;
    bool isOpen() const override { return port_.isOpen(); }
    std::string input() override;
    void output(std::string_view bytes) override;
    std::string problem() const override { return problem_; }
    /// What the line does not take within this time is dropped: a far end that holds the line up
    /// must not hold up the program. 10 s at first.
    void setWriteTimeout(int ms) { writing_.setInterval(ms); }
    std::size_t bytesToWrite() const override {
        return static_cast<std::size_t>(port_.bytesToWrite());
    }

  private:
    bool hungUp() const;
    void letDrain() const;
    void lost();
    std::string openProblem() const;

    QtEvents& events_;
    QSerialPort port_;
    QTimer writing_;  ///< runs while bytes wait for the line
    std::string name_;
    std::string problem_;
    int source_ = 0;
};

class QtSerialPortList : public SerialPortList {
  public:
    /// `folder` is where the kernel lists its terminals.
    explicit QtSerialPortList(QString folder = "/sys/class/tty") : folder_(std::move(folder)) {}
    std::vector<std::string> names() override;

  private:
    QString folder_;
};

}  // namespace zel
