#pragma once
// The status line at the foot of the window, with the state of the connection.

#include <QLabel>
#include <QMainWindow>
#include <QProgressBar>
#include <QTimer>

#include "desktop/binders/Binder.h"
#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "model/ZEL3Variables.h"

namespace zel {

class StatusLine : public QObject {
  public:
    StatusLine(QMainWindow& window, Forms& forms, const ZEL3Variables& mirror, Binder& binder);

    /// Writes the state of the connection again.
    void showState();
    /// Something that the window itself has to say, in the place of the last step for a while.
    void say(const QString& text);

  private:
    QString stateText() const;
    void showActivity(bool active);
    bool busy() const;
    /// How long the instrument lets wait; of a sweep that takes long, how far it has come.
    void showWait();

    QMainWindow& window_;
    Forms& forms_;
    ControllerForm& panel_;
    const ZEL3Variables& mirror_;
    QLabel* state_;
    QLabel* activity_;
    QProgressBar* busy_;
    QProgressBar* sweep_;
    QLabel* wait_;
    QTimer activityOff_;
    QTimer waitTimer_;
    int waitedMs_ = 0;
};

/// "9102 #100234" of "MAKER,9102,100234,1.05": who answers, in few words; else the whole text.
QString shortIdentity(const QString& identity);

}  // namespace zel
