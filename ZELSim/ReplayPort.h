#pragma once
// A recorded session at the program's port or socket, in the program's own time.

#include <cstddef>
#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <string_view>

#include "ZELSim/ReplayLine.h"
#include "platform/Clock.h"
#include "platform/Event.h"
#include "platform/Events.h"
#include "platform/SerialPort.h"
#include "platform/Socket.h"
#include "support/SessionCompare.h"
#include "support/SessionText.h"

namespace zelsim {

/// The recorded line in the time of a clock that can be moved: the bytes that the host sends bring
/// it to the moment at which they were sent then.
class ReplaySource {
  public:
    /// `moveTo` brings the clock to that many microseconds, if it is not beyond them.
    ReplaySource(const zel::SessionRecord& record, const zel::Clock& clock, zel::Events& events,
                 std::function<void(std::int64_t)> moveTo);
    ~ReplaySource();
    ReplaySource(const ReplaySource&) = delete;
    ReplaySource& operator=(const ReplaySource&) = delete;

    /// False where the recorded session did not open its line at this place.
    bool open();
    void close();
    void send(std::string_view bytes);
    std::string take();
    const std::string& waiting();
    const zel::SessionCompare& compare() const { return line_.compare(); }
    /// Microseconds of the clock at which the record began.
    std::int64_t origin() const { return origin_; }

    zel::Event<> Arrived;

  private:
    void catchUp();
    void watch();

    const zel::SessionRecord& record_;
    const zel::Clock& clock_;
    zel::Events& events_;
    std::function<void(std::int64_t)> moveTo_;
    ReplayLine line_;
    std::int64_t origin_;
    std::int64_t seen_;
    std::size_t opens_ = 0;  // events before this one are used up as openings
    std::string waiting_;
    std::optional<zel::TaskId> task_;
};

class ReplayPort : public zel::SerialPort {
  public:
    explicit ReplayPort(ReplaySource& source);
    bool open(const zel::SerialSetup& setup) override;
    void close() override;
    bool isOpen() const override { return open_; }
    std::string input() override { return open_ ? source_.take() : std::string(); }
    void output(std::string_view bytes) override;
    std::string problem() const override { return problem_; }

  private:
    ReplaySource& source_;
    bool open_ = false;
    std::string problem_;
    zel::Handlers handlers_;
};

class ReplaySocket : public zel::Socket {
  public:
    explicit ReplaySocket(ReplaySource& source);
    void connectTo(const std::string& host, int port) override;
    void connectTls(const std::string& host, int port, const std::string& pinned) override;
    void close() override;
    zel::SocketState state() const override { return state_; }
    bool sendData(std::string_view bytes) override;
    std::string peekData() override { return connected() ? source_.waiting() : std::string(); }
    std::string getData() override { return connected() ? source_.take() : std::string(); }
    std::size_t bytesToWrite() const override { return 0; }
    std::string problem() const override { return problem_; }

  private:
    bool connected() const { return state_ == zel::SocketState::Connected; }

    ReplaySource& source_;
    zel::SocketState state_ = zel::SocketState::Closed;
    std::string problem_;
    zel::Handlers handlers_;
};

}  // namespace zelsim
