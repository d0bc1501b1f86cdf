#pragma once
// The status line at the foot of the window, with the state of the connection.

#include <QLabel>
#include <QMainWindow>
#include <QProgressBar>
#include <QTimer>

#include "desktop/binders/Binder.h"
#include "forms/Forms.h"

namespace zel {

class StatusLine : public QObject {
  public:
    StatusLine(QMainWindow& window, Forms& forms, Binder& binder);

    /// Writes the state of the connection again.
    void showState();
    /// Something that the window itself has to say, in the place of the last step for a while.
    void say(const QString& text);

  private:
    QString stateText() const;
    void showActivity(bool active);
    bool busy() const;

    QMainWindow& window_;
    Forms& forms_;
    ControllerForm& panel_;
    QLabel* state_;
    QLabel* activity_;
    QProgressBar* busy_;
    QTimer activityOff_;
};

/// "9102 #100234" of "MAKER,9102,100234,1.05": who answers, in few words; else the whole text.
QString shortIdentity(const QString& identity);

}  // namespace zel
