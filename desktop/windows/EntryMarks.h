#pragma once
// Marks an entry that the instrument did not take, and what rests on it.

#include <QLabel>
#include <QObject>
#include <array>
#include <cstdint>
#include <optional>
#include <string>

#include "desktop/binders/Binder.h"
#include "forms/ControllerForm.h"
#include "model/ZEL3Variables.h"
#include "shell/Program.h"

namespace zel {

/// The box or list of a refused entry is struck, with the refusal beside it, until its text changes
/// or the instrument is asked. Boxes that were worked out of a refused frequency or span are struck
/// with it; when a sweep has asked what the instrument has, they show that.
class EntryMarks : public QObject {
  public:
    static constexpr int kBoxes = 5;

    /// `refusals` stand beside the boxes.
    EntryMarks(Program& program, Binder& binder, const std::array<QLabel*, kBoxes>& refusals,
               QObject* parent);

  private:
    struct Mark {
        QString reason;
        std::string text;     ///< of the box when it was marked
        bool onAxis = false;  ///< ends when the setting is known
    };
    void follow(int box);
    void takeMenu();
    void refused(int status);
    void chosen(int box);
    /// What stands in the box or in the list at its place.
    std::string shownText(int box) const;
    void takeUnsure();
    void showInstrument();
    void mark(int box, const QString& reason, bool onAxis);
    void clear(int box);
    bool restsOnUnsure(int box) const;
    void show(int box);

    ControllerForm& panel_;
    const ZEL3Variables& mirror_;
    Binder& binder_;
    std::array<QLabel*, kBoxes> refusals_;
    std::array<Mark, kBoxes> marks_;
    int entering_ = -1;                 ///< the box whose Enter is at work
    std::optional<int> refusedChoice_;  ///< answer to the choice that is at work
    std::int16_t state_ = 0;
    bool unsure_ = false;
};

}  // namespace zel
