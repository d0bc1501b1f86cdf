#pragma once
// A serial port of the computer.

#include <QByteArray>
#include <QSerialPort>
#include <string>

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
    std::size_t bytesToWrite() const override {
        return static_cast<std::size_t>(port_.bytesToWrite());
    }

  private:
    bool hungUp() const;
    void lost();
    std::string openProblem() const;

    QtEvents& events_;
    QSerialPort port_;
    std::string name_;
    std::string problem_;
    int source_ = 0;
};

class QtSerialPortList : public SerialPortList {
  public:
    std::vector<std::string> names() override;
};

}  // namespace zel
