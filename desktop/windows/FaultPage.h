#pragma once
// The page of distances in another cable than the one that the instrument was set to.

#include <QComboBox>
#include <QLabel>
#include <QLineEdit>
#include <QTableWidget>

#include "analysis/TraceTools.h"
#include "desktop/windows/TracePage.h"

namespace zel {

class FaultPage : public TracePage {
  public:
    explicit FaultPage(TraceTools& tools);
    void showState() override;

  private:
    QLineEdit* assumed_;
    QComboBox* cable_;
    QLineEdit* factor_;
    QTableWidget* table_;
    QLabel* word_;
};

}  // namespace zel
