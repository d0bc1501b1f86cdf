#pragma once
// The page of the statistics over time: a graph of lowest, mean and highest level, and occupancy.

#include <qcustomplot.h>

#include <QCheckBox>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>

#include "analysis/TraceTools.h"
#include "desktop/windows/TracePage.h"

namespace zel {

class StatisticsPage : public TracePage {
  public:
    explicit StatisticsPage(TraceTools& tools);
    void showState() override;

  private:
    void takeSettings();

    QCheckBox* on_;
    QLineEdit* threshold_;
    QLabel* count_;
    QPushButton* save_;
    QCustomPlot* plot_;
};

}  // namespace zel
