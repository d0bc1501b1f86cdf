#pragma once
// The sweeps of the last while, more of them than the graph of the waterfall holds.

#include <cstddef>
#include <cstdint>
#include <deque>
#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "forms/WaterfallForm.h"
#include "platform/Event.h"

namespace zel {

/// The header of a saved view, taken apart so that sweeps of the same settings share it.
struct SweepHeader {
    std::string head;
    std::string moment;  ///< the lines of date and time
    std::string tail;
};

/// One sweep as it was shown and as it came.
class HistoryRow {
  public:
    HistoryRow(const std::vector<double>& shown, double low, double high,
               const std::vector<double>& raw);
    /// Of levels that are steps already: level i is `low` + `step` * `codes`[i].
    HistoryRow(std::vector<std::uint16_t> codes, double low, double step);

    std::string time;
    double firstX = 0;  ///< in the unit of the x axis
    double increment = 0;
    bool pairs = false;  ///< two values a point, by the auto peak detector
    std::size_t size() const { return shown_.size(); }
    /// In the unit of the level axis, to a 65,000th of its height.
    double level(std::size_t index) const;
    std::vector<double> levels() const;
    double low() const { return low_; }
    double step() const { return step_; }
    const std::vector<std::uint16_t>& codes() const { return shown_; }
    /// As read, in the reference unit.
    const std::vector<float>& raw() const { return raw_; }
    /// Null for a row of a loaded file.
    std::shared_ptr<const SweepHeader> header;
    std::string moment;

  private:
    std::vector<std::uint16_t> shown_;
    std::vector<float> raw_;
    double low_;
    double step_;
};

class SweepHistory {
  public:
    static constexpr int kRows = 2000;  ///< 8 MB at most
    static constexpr std::size_t kLongestRow = 602;

    /// Takes each row over that the graph of the waterfall gets.
    explicit SweepHistory(Forms& forms);
    /// The header that a live sweep would be saved with now; without it none is kept.
    std::function<std::string()> describe;

    int count() const { return static_cast<int>(rows_.size()); }
    /// 0 is the newest.
    const HistoryRow& row(int back) const {
        return rows_[rows_.size() - 1 - static_cast<std::size_t>(back)];
    }
    /// Rows that ever came.
    unsigned long added() const { return added_; }
    /// Takes a row in as the newest.
    void add(HistoryRow row);
    void clear();

    Event<> Added;
    Event<> Cleared;

    /// All live sweeps as a recording, oldest first; empty without any.
    std::string recording() const;

  private:
    void take();

    ControllerForm& panel_;
    WaterfallForm& form_;
    std::deque<HistoryRow> rows_;
    unsigned long added_ = 0;
    Handlers handlers_;
};

}  // namespace zel
