#pragma once
// The program's core on the Qt platform, connected to an instrument, with its bytes counted.

#include <QTemporaryDir>
#include <cstddef>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

#include "desktop/platform/QtPlatform.h"
#include "platform/LinkAddress.h"
#include "platform/MessageBox.h"
#include "platform/SerialPort.h"
#include "shell/Program.h"

namespace zelbench {

/// A serial port that counts what passes.
class CountingPort : public zel::SerialPort {
  public:
    explicit CountingPort(zel::SerialPort& port);
    bool open(const zel::SerialSetup& setup) override { return port_.open(setup); }
    void close() override { port_.close(); }
    bool isOpen() const override { return port_.isOpen(); }
    std::string input() override;
    void output(std::string_view bytes) override;
    std::string problem() const override { return port_.problem(); }

    std::size_t bytes() const { return bytes_; }

  private:
    zel::SerialPort& port_;
    std::size_t bytes_ = 0;
};

/// In a measured run nobody is there to answer: a box is a failure.
class NoBoxes : public zel::MessageBoxes {
  public:
    zel::BoxAnswer show(const zel::Box& box) override;
    std::optional<std::string> prompt(const std::string& text, const std::string& title,
                                      const std::string& preset) override;
};

/// Needs a QCoreApplication.
class CoreSession {
  public:
    /// Connects over the serial device. Throws std::runtime_error when that fails.
    CoreSession(const std::string& device, int baud);
    /// The same over any link; `bytes` counts those of a serial device only.
    explicit CoreSession(const zel::LinkAddress& address);
    ~CoreSession();

    /// One full read cycle. Throws std::runtime_error when it fails.
    void sweep();
    /// Bytes on the line so far, both ways.
    std::size_t bytes() const { return port_.bytes(); }
    /// Seconds of the instrument's sweep.
    double sweepTime() { return program_->variables().SweepTime; }
    zel::Program& program() { return *program_; }

  private:
    QTemporaryDir home_;
    zel::QtPlatform platform_;
    CountingPort port_{platform_.serialPort};
    NoBoxes boxes_;
    std::unique_ptr<zel::Program> program_;
};

}  // namespace zelbench
