#pragma once
// Answers as the instrument of a recorded session did, as long as the host sends the same.

#include <cstddef>
#include <cstdint>
#include <deque>
#include <functional>
#include <optional>
#include <string>
#include <string_view>

#include "ZELSim/HostLine.h"
#include "support/SessionCompare.h"
#include "support/SessionText.h"

namespace zelsim {

class ReplayLine : public HostLine {
  public:
    /// With `paced` an answer comes as long after the host's bytes as it did then, else at once.
    /// The record must outlive this.
    ReplayLine(const zel::SessionRecord& record, bool paced);

    /// Called once, with "byte N differs: HEX instead of HEX". Nothing is answered from then on.
    std::function<void(const std::string&)> differs;
    const zel::SessionCompare& compare() const { return compare_; }

    void receive(std::string_view bytes) override;
    void advance(double seconds) override;
    std::string take() override;
    std::optional<double> nextDue() const override;
    void reset() override { waiting_.clear(); }
    bool congested() const override { return false; }
    void setHostBaud(int /*baud*/) override {}

  private:
    struct Answer {
        std::int64_t due;  // microseconds of this line's time
        std::string bytes;
    };
    void release();

    const zel::SessionRecord& record_;
    bool paced_;
    zel::SessionCompare compare_;
    std::size_t released_ = 0;         // events before this one have been dealt with
    std::int64_t now_ = 0;             // microseconds
    std::int64_t anchor_ = 0;          // when the host's last bytes of an event were complete
    std::int64_t recordedAnchor_ = 0;  // the same in the record
    std::deque<Answer> waiting_;
};

}  // namespace zelsim
