#pragma once
// A pseudo terminal as the instrument's serial port.

#include <string>

#include "ZELSim/Transport.h"

namespace zelsim {

class PtyEndpoint : public Endpoint {
  public:
    PtyEndpoint() = default;
    ~PtyEndpoint() override;
    PtyEndpoint(const PtyEndpoint&) = delete;
    PtyEndpoint& operator=(const PtyEndpoint&) = delete;

    /// Makes the terminal, with a symbolic link to its device where `link` is not empty (an old
    /// symbolic link of that name is replaced). With `strictBaud` the rate that the host sets is
    /// looked at; `baud` is what it is set to at first. With `noticesClose` a host that closes the
    /// terminal is noticed, as by a modem that sees DTR. False: `problem` says why.
    bool open(const std::string& link, int baud, bool strictBaud, bool noticesClose = false);
    const std::string& device() const { return device_; }
    const std::string& problem() const { return problem_; }

    int line() const override { return master_; }
    int door() const override { return -1; }
    bool admit() override { return false; }
    /// A terminal stays: the next host finds it as it is.
    void lost() override {}
    int hostBaud() const override;

  private:
    bool fail(const std::string& what);
    bool makeLink(const std::string& link);

    int master_ = -1;
    int slave_ = -1;  // kept open where the line is to survive hosts that close it
    bool strictBaud_ = false;
    std::string device_;
    std::string link_;
    std::string problem_;
};

}  // namespace zelsim
