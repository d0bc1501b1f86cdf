#pragma once
// The windows of the measurement scripts: the list that runs, the results of complex traces.

#include <QListWidget>
#include <QTextEdit>
#include <string>
#include <vector>

#include "desktop/binders/Binder.h"
#include "desktop/windows/FormWindow.h"
#include "forms/ScriptForms.h"
#include "platform/Controls.h"

namespace zel {

/// The list with the running line marked, the options of a run, the keys that run it.
class ScriptFormWindow : public FormWindow {
  public:
    ScriptFormWindow(SpecialMeasForm& form, Binder& binder, QWidget* parent);

  private:
    QWidget* fileRow();
    QWidget* optionRow();
    QWidget* keyRow();
    void showList();

    SpecialMeasForm& script_;
    QListWidget* list_;
    std::vector<std::string> shown_;
};

/// The figures of the newest measurement over the rows of all.
class StatisticsWindow : public FormWindow {
  public:
    StatisticsWindow(STDForm& form, Binder& binder, QWidget* parent);

  private:
    QWidget* figures(STDForm& form);
    QTextEdit* textBox(RichText& control);
};

}  // namespace zel
