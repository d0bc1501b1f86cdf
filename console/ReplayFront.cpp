#include "console/ReplayFront.h"

#include <cstdint>
#include <memory>
#include <string>
#include <utility>

#include "ZELSim/ReplayPort.h"
#include "console/VirtualFront.h"
#include "desktop/platform/SystemPortProbe.h"
#include "platform/virtual/ScriptedPort.h"
#include "support/SessionText.h"

namespace zel {
namespace {

class ReplayFront : public VirtualFront {
  public:
    ReplayFront(const SessionRecord& record, const std::string& home)
        : VirtualFront(home),
          source_(record, clock_, events_, [this](std::int64_t micros) { passTo(micros); }) {}

    void passTo(std::int64_t micros) { clock_.advanceMicros(micros - clock_.micros()); }

  private:
    Lines lines() override { return {port_, tcpSocket_, serverPort_, portProbe_}; }

    zelsim::ReplaySource source_;
    zelsim::ReplayPort port_{source_};
    zelsim::ReplaySocket tcpSocket_{source_};
    ScriptedPort serverPort_{events_};
    SystemPortProbe portProbe_;
};

}  // namespace

ReplayStage makeReplayFront(const SessionRecord& record, const std::string& home) {
    auto front = std::make_unique<ReplayFront>(record, home);
    const auto passTo = [&own = *front](std::int64_t micros) { own.passTo(micros); };
    return {std::move(front), passTo};
}

}  // namespace zel
