#pragma once
// Event filters between widgets and their controls.

#include <QComboBox>
#include <QEvent>
#include <QObject>

#include "platform/Controls.h"

namespace zel {

/// Gives a button each key that it gets, F1 among them.
class KeyTeller : public QObject {
  public:
    KeyTeller(Button& control, QObject* parent) : QObject(parent), control_(control) {}
    bool eventFilter(QObject* watched, QEvent* event) override;

  private:
    Button& control_;
};

/// Keeps a locked list shut but readable, and the wheel from changing a list that it only passes.
class ListGuard : public QObject {
  public:
    ListGuard(DropDownList& control, QComboBox* widget) : QObject(widget), control_(control) {}
    bool eventFilter(QObject* watched, QEvent* event) override;

  private:
    DropDownList& control_;
};

}  // namespace zel
