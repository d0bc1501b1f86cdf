#pragma once
// Opens the server's serial port and finds the instrument and its baud rate.

#include <string>

#include "forms/ServerForm.h"
#include "link/RS232Ops.h"
#include "platform/SerialPort.h"
#include "platform/Session.h"
#include "support/RootDebug.h"

namespace zel {

class InstrumentSearch {
  public:
    /// The index of 57600 in `BaudList`.
    static constexpr int kLineSpeed = 3;

    InstrumentSearch(ServerForm& form, SerialPort& SystemCommPort, const Session& services,
                     RootDebug& log);

    /// Takes port and speed from the form; with `chkBaudRate` each speed of the list is tried and
    /// an instrument at another one is switched to 57600. What fails is reported; the port stays as
    /// it is then.
    void ConnectInstrument(bool& ok);
    void CheckProbeAnswer(const std::string& text, bool& ok);
    /// Ends a search that runs, without a word.
    void stop() { stopped_ = true; }
    bool stopped() const { return stopped_; }
    /// Failures give only `problem` and no box, as for a try that nobody asked for.
    void setQuiet(bool quiet) { quiet_ = quiet; }
    const std::string& problem() const { return problem_; }

  private:
    enum class Probe { Found, Elsewhere, Absent };

    bool openPort();
    bool search();
    Probe probe();
    bool switchSpeed();
    bool nextEntry();
    std::string ask(const std::string& line, int patienceMs);
    void report(const std::string& text, bool warning);

    ServerForm& form_;
    SerialPort& port_;
    Session services_;
    RootDebug& log_;
    RS232Ops ports_;
    bool stopped_ = false;
    bool quiet_ = false;
    std::string problem_;
};

}  // namespace zel
