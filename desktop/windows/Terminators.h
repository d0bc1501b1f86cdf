#pragma once
// The terminator keys of the numeric entry: each ends a typed number with its unit and sends it.

#include <QPushButton>
#include <QWidget>
#include <array>
#include <cstddef>
#include <vector>

#include "desktop/binders/Binder.h"
#include "forms/ControllerForm.h"
#include "model/ZEL3Variables.h"
#include "panel/SoftPositions.h"

class QKeyEvent;

namespace zel {

struct Terminator {
    const char* caption;  ///< on the key
    const char* typed;    ///< what stands after the number, before Enter
    char letter;          ///< of the shortcut with Alt; 0 where Enter does the same
};

/// The terminators of a soft position, as the current menu has its unit. Never empty: a box without
/// a unit of its own has Enter.
const std::vector<Terminator>& terminatorsOf(const ControllerForm& panel,
                                             const ZEL3Variables& mirror, int position);
/// What a soft position takes, with marker and trigger made into what they are at the moment.
EntryUnit entryUnitOf(const ControllerForm& panel, const ZEL3Variables& mirror, int position);
/// A number with a point and without a unit, to which a terminator can add one.
bool isBareNumber(const QString& text);

/// A row of four keys under the soft positions, and the numeric entry that needs no focus: digits
/// that no widget takes go to the box of the soft key that was pressed last.
class TerminatorRow : public QWidget {
  public:
    TerminatorRow(ControllerForm& panel, const ZEL3Variables& mirror, Binder& binder,
                  QWidget* parent = nullptr);

    /// Makes Alt and a letter press the key of that letter.
    void buildShortcuts(QWidget& window);
    /// Takes a digit, a sign or a point into the box of the position in use. False when the key is
    /// none of these, or when there is no box to type into.
    bool typeAhead(const QKeyEvent& event);
    /// The position that the keys act on, or -1: that of the box with the focus, else that of the
    /// red soft key, else the first with a box.
    int position() const;
    /// Captions as the position needs them.
    void refresh();
    const std::array<QPushButton*, 4>& keys() const { return keys_; }

  protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

  private:
    void followPositions();
    PanelLineEdit* boxOf(int position) const;
    void press(std::size_t index);
    void pressLetter(char letter);

    ControllerForm& panel_;
    const ZEL3Variables& mirror_;
    Binder& binder_;
    std::array<QPushButton*, 4> keys_{};
    QTimer changed_;
};

}  // namespace zel
