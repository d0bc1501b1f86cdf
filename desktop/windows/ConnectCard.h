#pragma once
// Stands on the graph while the program connects without a dialog: the step, the seconds, Cancel;
// after a failure what to check, another attempt and the search over the baud rates.

#include <QFrame>
#include <QLabel>
#include <QProgressBar>
#include <QPushButton>
#include <functional>
#include <string>

#include "desktop/binders/Binder.h"
#include "forms/Forms.h"
#include "platform/Controls.h"

namespace zel {

/// "port open, waiting, 4 of 9 s" as share of a bar; a bar that only says that work is under way
/// where no seconds stand.
void showWait(QProgressBar& bar, const std::string& step);

class ConnectCard : public QFrame {
  public:
    /// `again` makes the same attempt once more; `changed` hears that the card comes, goes or
    /// grows.
    struct Ways {
        std::function<void()> again;
        std::function<void()> changed;
    };
    ConnectCard(Forms& forms, Binder& binder, Ways ways, QWidget* parent);

    /// As the forms have it.
    void giveRoom();
    void take();
    bool wanted() const { return wanted_; }

  protected:
    /// Esc is Cancel, or Close after a failure; it comes here first, not to the panel's Stop.
    bool event(QEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;

  private:
    bool connecting() const;
    QString heading() const;
    void cancel();
    void click(Button& button);

    Forms& forms_;
    Binder& binder_;
    Ways ways_;
    QLabel* heading_;
    QLabel* step_;
    QProgressBar* wait_;
    QPushButton* cancel_;
    QPushButton* again_;
    QPushButton* search_;
    QPushButton* close_;
    bool wanted_ = false;
    bool failed_ = false;
    bool roomGiven_ = false;
    bool putAway_ = false;  ///< the failure was read
};

}  // namespace zel
