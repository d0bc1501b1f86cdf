#pragma once
// The page of the peaks, and the page of the markers that follow them.

#include <QComboBox>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QTableWidget>
#include <array>
#include <cstddef>
#include <functional>

#include "analysis/HostMarkers.h"
#include "analysis/TraceTools.h"
#include "desktop/windows/TracePage.h"

namespace zel {

class PeaksPage : public TracePage {
  public:
    /// `goTo` puts a marker on a peak (from 1).
    PeaksPage(TraceTools& tools, std::function<void(std::size_t)> goTo);
    void showState() override;
    /// The table as text, with tabs.
    QString asText() const;

  private:
    void takeSettings();

    QTableWidget* table_;
    QLineEdit* count_;
    QLineEdit* threshold_;
    QLineEdit* excursion_;
    QComboBox* order_;
    QPushButton* copy_;
    QPushButton* save_;
};

class MarkersPage : public TracePage {
  public:
    explicit MarkersPage(TraceTools& tools);
    void showState() override;
    /// Puts the first free marker, or M1, on the n-th peak.
    void follow(std::size_t peak);

  private:
    void takeSettings();
    void takePlace(int row, const QString& text);

    QTableWidget* table_;
    QLabel* word_;
    std::array<QComboBox*, kHostMarkers> follows_{};
    std::array<QComboBox*, kHostMarkers> delta_{};
};

}  // namespace zel
