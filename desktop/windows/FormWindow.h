#pragma once
// A dialog window for a form: shown, hidden and modal as the form says.

#include <QDialog>
#include <QProgressBar>
#include <functional>
#include <vector>

#include "desktop/binders/Binder.h"
#include "desktop/platform/KeyCodes.h"
#include "platform/Controls.h"
#include "platform/Form.h"

namespace zel {

class FormWindow : public QDialog {
  public:
    FormWindow(Form& form, Binder& binder, QWidget* parent);

  protected:
    /// The first field that takes an entry has the focus, else the default button.
    virtual void focusFirst();
    /// After the building of the window's content.
    void followForm();
    /// The button that Esc stands for, while it can be pressed.
    void setCancel(const Button& button) { cancels_.push_back(&button); }
    /// `problem` says why a text of the field cannot be taken, or nothing. Such a text is marked,
    /// and the button that takes the fields over cannot be used meanwhile.
    void checkField(PanelLineEdit& line, std::function<QString(const QString&)> problem);
    /// The same for a list into which one can type.
    void checkField(QComboBox& list, std::function<QString(const QString&)> problem);
    void setAccept(const Control& control) { accept_ = &control; }
    void checkFields();
    void closeEvent(QCloseEvent* event) override;
    void reject() override;
    void keyPressEvent(QKeyEvent* event) override;

    Form& form_;
    Binder& binder_;
    /// The window is hidden although its form is on show, or comes back.
    void setPutAway(bool away);

    std::vector<const Button*> cancels_;
    QTimer shown_;
    bool putAway_ = false;
    std::vector<std::function<QString()>> checked_;
    const Control* accept_ = nullptr;
    QProgressBar* busy_ = nullptr;  ///< runs while the form shows the hourglass
};

/// A window that lays the form's controls out in their order: a row a text box, options below
/// each other, buttons at the foot. A label before a text box is its caption.
class PlainFormWindow : public FormWindow {
  public:
    PlainFormWindow(Form& form, Binder& binder, QWidget* parent);
};

/// The connection dialog.
class MainForm;
class ConnectionWindow : public FormWindow {
  public:
    ConnectionWindow(MainForm& form, Binder& binder, QWidget* parent);

  protected:
    bool event(QEvent* event) override;
};

}  // namespace zel
