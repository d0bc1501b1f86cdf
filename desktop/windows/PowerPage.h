#pragma once
// The page of bandwidths and powers: n-dB bandwidth, channel, adjacent channels, occupied.

#include <QLabel>
#include <QLineEdit>

#include "analysis/TraceTools.h"
#include "desktop/windows/TracePage.h"

namespace zel {

class PowerPage : public TracePage {
  public:
    explicit PowerPage(TraceTools& tools);
    void showState() override;

  private:
    void takeSettings();

    QLineEdit* down_;
    QLineEdit* start_;
    QLineEdit* stop_;
    QLineEdit* percent_;
    QLineEdit* width_;
    QLineEdit* spacing_;
    QLabel* bandwidth_;
    QLabel* channel_;
    QLabel* occupied_;
    QLabel* adjacent_;
    QLabel* word_;
};

}  // namespace zel
