#pragma once
// The keys at the right of the graph, as on the instrument's front: one column of fixed width.

#include <QScrollArea>
#include <array>
#include <vector>

#include "desktop/binders/Binder.h"
#include "desktop/windows/FoldGroup.h"
#include "desktop/windows/Terminators.h"
#include "forms/ControllerForm.h"
#include "model/ZEL3Variables.h"
#include "platform/Controls.h"

class QVBoxLayout;

namespace zel {

class PanelSide : public QScrollArea {
    Q_OBJECT

  public:
    /// Pixels, whatever the width of the window.
    static constexpr int kWidth = 336;

    PanelSide(ControllerForm& panel, const ZEL3Variables& mirror, Binder& binder,
              QWidget* parent = nullptr);
    TerminatorRow& terminators() { return *terminators_; }
    const std::vector<FoldGroup*>& groups() const { return groups_; }
    /// Opens and folds the groups that the user has not chosen for, so that the rest fits.
    void foldByRoom();
    /// Lays the panel out at once, and takes what it has posted to itself for later.
    void settle();
    /// A line says why keys are grey while the continuous view runs, else that the boxes show the
    /// instrument while the graph shows a file.
    void showState(bool viewRuns, bool fileShown);
    /// Beside the five boxes: why the instrument did not take an entry.
    const std::array<QLabel*, 5>& refusals() const { return refusals_; }

  signals:
    /// The user has folded or opened a group.
    void folded();

  protected:
    void resizeEvent(QResizeEvent* event) override;

  private:
    QWidget* runKeys();
    QWidget* softPositions();
    QWidget* softPosition(int index);
    QWidget* hardKeys();
    QWidget* modeKeys();
    QWidget* markerKeys();
    QWidget* commandLine();
    FoldGroup* addGroup(const QString& name, const QString& caption, QWidget* content);
    QPushButton* key(Button& control, bool tall = false);
    QPushButton* fitted(QPushButton* button, Button& control, bool tall);

    bool readPosition(int index, QString& text, QString& problem) const;

    ControllerForm& panel_;
    const ZEL3Variables& mirror_;
    Binder& binder_;
    TerminatorRow* terminators_;
    QLabel* reason_ = nullptr;
    std::array<QLabel*, 5> refusals_{};
    QWidget* column_;
    QVBoxLayout* layout_;
    std::vector<FoldGroup*> groups_;  ///< the first one folds last
};

}  // namespace zel
