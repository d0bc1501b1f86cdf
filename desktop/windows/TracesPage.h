#pragma once
// The page of the traces kept on the host: holds, averages, references.

#include <QCheckBox>
#include <QGridLayout>
#include <QLabel>
#include <QPushButton>
#include <QToolButton>
#include <array>
#include <cstddef>
#include <functional>
#include <optional>

#include "analysis/HostTraces.h"
#include "analysis/TraceTools.h"
#include "desktop/windows/TracePage.h"

namespace zel {

class TracesPage : public TracePage {
  public:
    /// `scale` fits the level axis to what is there.
    TracesPage(TraceTools& tools, std::function<void()> scale);
    void showState() override;

    /// Names of the holds, in the order of `HoldKind`.
    static constexpr std::array<const char*, kHolds> kNames = {
        QT_TRANSLATE_NOOP("QObject", "Max hold"), QT_TRANSLATE_NOOP("QObject", "Min hold"),
        QT_TRANSLATE_NOOP("QObject", "Average, level"),
        QT_TRANSLATE_NOOP("QObject", "Average, power")};

    bool memoryShown(std::size_t place) const { return memories_.at(place).show->isChecked(); }
    /// Of a hold, then of a reference, then (the last) of the corrected or normalised sweep.
    QColor color(std::size_t place) const { return colors_.at(place); }
    /// Takes a trace of a saved view or a recording as a reference; what is wrong stands below.
    void loadMemory(std::size_t place, const QString& path);
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
        QPushButton* load;
        QCheckBox* show;
        QCheckBox* less;
        QPushButton* clear;
    };
    QToolButton* swatch(std::size_t place, const QString& name, const QString& shown);
    void paint(std::size_t place, const QColor& color);
    void buildMemory(QGridLayout& grid, int row, std::size_t place);

    static constexpr std::size_t kColors = kHolds + kMemories + 1;
    std::array<QColor, kColors> colors_{};
    std::array<QToolButton*, kColors> swatches_{};
    QString fileWord_;  ///< what became of the last file
    std::array<HoldRow, kHolds> holds_{};
    std::array<MemoryRow, kMemories> memories_{};
    QLabel* word_;
};

}  // namespace zel
