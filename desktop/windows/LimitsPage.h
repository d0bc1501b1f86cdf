#pragma once
// The page of the limits (masks) and of the corrections.

#include <QLabel>
#include <QPlainTextEdit>

#include "analysis/Correction.h"
#include "analysis/TraceTools.h"
#include "desktop/windows/TracePage.h"

namespace zel {

class LimitsPage : public TracePage {
  public:
    explicit LimitsPage(TraceTools& tools);
    void showState() override;
    /// Takes a table as the mask; what is wrong with it stands under it.
    void applyMask(const QString& table);
    void addCorrection(CorrectionKind kind, const QString& name, const QString& table);

  private:
    QPlainTextEdit* table_;
    QLabel* verdict_;
    QLabel* corrections_;
    QLabel* word_;
};

}  // namespace zel
