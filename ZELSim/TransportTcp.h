#pragma once
// A TCP port as the instrument's line, as a bridge at the instrument offers it.

#include <string>

#include "ZELSim/Transport.h"

namespace zelsim {

/// One host at a time; a new one takes the place of an old one.
class TcpEndpoint : public Endpoint {
  public:
    TcpEndpoint() = default;
    ~TcpEndpoint() override;
    TcpEndpoint(const TcpEndpoint&) = delete;
    TcpEndpoint& operator=(const TcpEndpoint&) = delete;

    /// Listens at "[ADDRESS:]PORT" (address 127.0.0.1; port 0: a free one). False: `problem` says
    /// why.
    bool open(const std::string& place);
    /// "ADDRESS:PORT" as it came out.
    const std::string& address() const { return address_; }
    const std::string& problem() const { return problem_; }

    int line() const override { return host_; }
    int door() const override { return listener_; }
    bool admit() override;
    void lost() override;
    int hostBaud() const override { return 0; }

  private:
    int listener_ = -1;
    int host_ = -1;
    std::string address_;
    std::string problem_;
};

}  // namespace zelsim
