#pragma once
// The readouts under the graph: centre and span, markers, pointer, pace.

#include <QLabel>
#include <QWidget>

#include "desktop/binders/Binder.h"
#include "forms/ControllerForm.h"

namespace zel {

class Readouts : public QWidget {
  public:
    Readouts(ControllerForm& panel, Binder& binder, QWidget* parent = nullptr);

    /// Frequency and level of the trace under the pointer; empty texts when it is elsewhere.
    void showPointer(const QString& position, const QString& level);
    /// What the trace has at the markers, apart from the instrument's own answer.
    void showTrace(const QString& atMarker, const QString& atDelta);

    /// Centre and span are those of a loaded file.
    void showFile(bool fromFile);

  private:
    QLabel* centre_;
    QLabel* span_;
    QLabel* pointer_;
    QLabel* pointerLevel_;
    QLabel* atMarker_;
    QLabel* atDelta_;
    QLabel* pace_ = nullptr;
};

}  // namespace zel
