#pragma once
// The page of the traces kept on the host: holds, averages, references.

#include <QCheckBox>
#include <QGridLayout>
#include <QLabel>
#include <QPushButton>
#include <array>

#include "desktop/windows/TracePage.h"

namespace zel {

class TracesPage : public TracePage {
  public:
    /// `scale` fits the level axis to what is there.
    TracesPage(TraceTools& tools, std::function<void()> scale);
    void showState() override;

    /// Names of the holds, in the order of `HoldKind`.
    static constexpr std::array<const char*, kHolds> kNames = {"Max hold", "Min hold",
                                                               "Average, level", "Average, power"};

    bool memoryShown(std::size_t place) const { return memories_.at(place).show->isChecked(); }
    /// The reference that is taken away from the sweep; nothing: none.
    std::optional<std::size_t> normalisedBy() const;

  private:
    struct HoldRow {
        QCheckBox* on;
        QLabel* count;
        QPushButton* clear;
    };
    struct MemoryRow {
        QPushButton* store;
        QCheckBox* show;
        QCheckBox* less;
        QPushButton* clear;
    };
    void buildMemory(QGridLayout& grid, int row, std::size_t place);

    std::array<HoldRow, kHolds> holds_{};
    std::array<MemoryRow, kMemories> memories_{};
    QLabel* word_;
};

}  // namespace zel
