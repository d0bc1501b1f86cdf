#pragma once
// The page of what happens when a sweep fails the mask: saved, recorded, a command.

#include <QCheckBox>
#include <QLabel>
#include <QLineEdit>
#include <QSpinBox>

#include "analysis/MaskWatch.h"
#include "analysis/TraceTools.h"
#include "desktop/windows/TracePage.h"

namespace zel {

class WatchPage : public TracePage {
  public:
    WatchPage(TraceTools& tools, MaskWatch& watch);
    void showState() override;

  private:
    void takeSettings();

    MaskWatch& watch_;
    QCheckBox* save_;
    QLineEdit* file_;
    QSpinBox* after_;
    QCheckBox* run_;
    QLineEdit* command_;
    QLabel* counts_;
    QLabel* word_;
};

}  // namespace zel
