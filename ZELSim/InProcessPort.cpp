#include "ZELSim/InProcessPort.h"

#include <cstddef>
#include <cstdint>
#include <string_view>
#include <utility>

#include "ZELSim/Device.h"
#include "ZELSim/HostLine.h"
#include "ZELSim/Numbers.h"
#include "ZELSim/Wire.h"
#include "platform/Clock.h"
#include "platform/Events.h"
#include "platform/SerialPort.h"

namespace zelsim {
namespace {

constexpr int kReceived = 2;  // CommEvent of arrived data

int baudOfSettings(std::string_view settings) {
    const auto baud = parseNumber(settings.substr(0, settings.find(',')));
    return baud && *baud > 0 && *baud < 1e7 ? static_cast<int>(*baud) : 0;
}

}  // namespace

InProcessPort::InProcessPort(const zel::Clock& clock, zel::Events& events,
                             const DeviceSetup& device, const WireSetup& wire)
    : clock_(clock),
      events_(events),
      device_(device),
      wire_(device_, wire),
      seen_(clock.micros()) {}

InProcessPort::~InProcessPort() {
    if (task_) {
        events_.cancel(*task_);
    }
}

bool InProcessPort::open(const zel::SerialSetup& setup) {
    catchUp();
    line_ = setup.CommPort == kModemPort ? static_cast<HostLine*>(&modem_) : &wire_;
    line_->reset();
    line_->setHostBaud(baudOfSettings(setup.Settings));
    waiting_.clear();
    open_ = true;
    return true;
}

void InProcessPort::close() {
    open_ = false;
    line_->reset();
    waiting_.clear();
    if (task_) {
        events_.cancel(*task_);
        task_.reset();
    }
}

std::string InProcessPort::input() {
    if (!open_) {
        return {};
    }
    catchUp();
    return std::exchange(waiting_, {});
}

void InProcessPort::output(std::string_view bytes) {
    if (!open_) {
        return;
    }
    catchUp();
    line_->receive(bytes);
    watch();
}

void InProcessPort::catchUp() {
    const std::int64_t now = clock_.micros();
    constexpr double perSecond = 1e6;
    line_->advance(static_cast<double>(now - seen_) / perSecond);
    seen_ = now;
    waiting_ += line_->take();
}

// Has the event loop come back when the next bytes are there.
void InProcessPort::watch() {
    if (task_) {
        events_.cancel(*task_);
        task_.reset();
    }
    if (const auto due = line_->nextDue()) {
        // A little late rather than a little early, by the clock's own step.
        constexpr double step = 0.001;
        const double ms = *due * 1000;
        task_ = events_.schedule(ms > 0 ? ms + step : 0, [this] { wake(); });
    }
}

void InProcessPort::wake() {
    task_.reset();
    const std::size_t before = waiting_.size();
    catchUp();
    watch();
    if (waiting_.size() > before) {
        OnComm(kReceived);
    }
}

}  // namespace zelsim
