#include "desktop/windows/FormWindow.h"

#include <QCloseEvent>
#include <QFormLayout>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QVBoxLayout>

#include "desktop/binders/ToolTips.h"
#include "forms/MainForm.h"

namespace zel {
namespace {

struct FieldCaption {
    const char* control;
    const char* caption;
};
constexpr FieldCaption kCaptions[] = {
    {"manualSizeMin", "Minimum"},  {"manualSizeMax", "Maximum"}, {"IPAdressTextBox", "Address"},
    {"RemotePortTextBox", "Port"}, {"IDTextBox", "State"},       {"localPortTextBox", "Local port"},
    {"txtDebug", "State"},
};

QString captionOf(const Control& control) {
    for (const FieldCaption& row : kCaptions)
        if (control.name() == row.control) return row.caption;
    return QString::fromStdString(control.name());
}

constexpr int kFieldWidth = 260;
constexpr int kHourglass = 11;

}  // namespace

FormWindow::FormWindow(Form& form, Binder& binder, QWidget* parent)
    : QDialog(parent), form_(form), binder_(binder) {
    setObjectName(QString::fromStdString(form.name()));
    setWindowFlag(Qt::WindowContextHelpButtonHint, false);
}

void FormWindow::followForm() {
    binder_.bindForm(form_, this, [this] {
        setWindowTitle(QString::fromStdString(form_.Caption));
        const bool shown = form_.Visible;
        const bool busy = form_.MousePointer == kHourglass;
        setCursor(busy ? Qt::BusyCursor : Qt::ArrowCursor);
        if (busy_ != nullptr) busy_->setVisible(busy);
        if (shown == isVisible()) return;
        if (shown) {
            setWindowModality(form_.Modal ? Qt::ApplicationModal : Qt::NonModal);
            show();
            raise();
            activateWindow();
        } else {
            hide();
        }
    });
}

void FormWindow::closeEvent(QCloseEvent* event) {
    int cancel = 0;
    form_.QueryUnload(cancel);
    if (cancel != 0) return event->ignore();
    form_.unload(0);
    event->accept();
}

void FormWindow::reject() { close(); }

void FormWindow::keyPressEvent(QKeyEvent* event) {
    // Enter presses the button that has the focus, else the one that the dialog is for.
    if (event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter) {
        if (auto* focused = qobject_cast<QPushButton*>(focusWidget())) return focused->click();
        for (QPushButton* button : findChildren<QPushButton*>())
            if (button->isDefault() && button->isVisible()) return button->click();
        return;
    }
    QDialog::keyPressEvent(event);
}

PlainFormWindow::PlainFormWindow(Form& form, Binder& binder, QWidget* parent)
    : FormWindow(form, binder, parent) {
    auto* layout = new QVBoxLayout(this);
    auto* fields = new QFormLayout;
    auto* buttons = new QHBoxLayout;
    buttons->addStretch(1);
    layout->addLayout(fields);
    for (Control* control : form.controls()) {
        if (control->kind() == ControlKind::TextBox) {
            auto* line = new PanelLineEdit;
            line->setMinimumWidth(kFieldWidth);
            fields->addRow(captionOf(*control), line);
            binder.bind(static_cast<TextBox&>(*control), line);
        } else if (control->kind() == ControlKind::OptionButton) {
            auto* option = new QRadioButton;
            layout->addWidget(option);
            binder.bind(static_cast<OptionButton&>(*control), option);
        } else if (control->kind() == ControlKind::Button) {
            auto* button = new QPushButton;
            button->setAutoDefault(false);
            button->setMinimumWidth(90);
            if (buttons->count() == 1) button->setDefault(true);  // behind the stretch
            buttons->addWidget(button);
            binder.bind(static_cast<Button&>(*control), button);
        }
    }
    layout->addStretch(1);
    layout->addLayout(buttons);
    followForm();
}

ConnectionWindow::ConnectionWindow(MainForm& form, Binder& binder, QWidget* parent)
    : FormWindow(form, binder, parent) {
    auto* layout = new QVBoxLayout(this);
    const auto box = [&binder](TextBox& control) {
        auto* line = new PanelLineEdit;
        line->setMinimumWidth(kFieldWidth);
        binder.bind(control, line);
        return line;
    };
    const auto list = [&binder](DropDownList& control) {
        auto* combo = new QComboBox;
        combo->setMinimumWidth(kFieldWidth);
        binder.bind(control, combo);
        return combo;
    };
    const auto button = [&binder](Button& control) {
        auto* key = new QPushButton;
        key->setAutoDefault(false);
        key->setMinimumWidth(100);
        binder.bind(control, key);
        return key;
    };

    auto* serial = new QGroupBox("Serial port");
    auto* serialFields = new QFormLayout(serial);
    serialFields->addRow("Port", list(form.COMList));
    serialFields->addRow("Baud rate", list(form.BaudList));
    auto* portState = new QLabel("The port is open");
    serialFields->addRow("", portState);
    serialFields->addRow("Instrument", box(form.IDText));
    binder.bind(form.DirectConnectionFrame, serial, nullptr);
    binder.bindShow(form.OnPic, portState,
                    [&form, portState] { portState->setVisible(form.OnPic.Visible); });
    layout->addWidget(serial);

    auto* dial = new QGroupBox("Dial");
    auto* dialFields = new QFormLayout(dial);
    dialFields->addRow("Number", box(form.TelNumberBox));
    dialFields->addRow("Modem", box(form.AirBaudRateText));
    auto* dialKeys = new QHBoxLayout;
    dialKeys->addWidget(button(form.DialButton));
    dialKeys->addWidget(button(form.CancelButton));
    dialKeys->addStretch(1);
    dialFields->addRow("", dialKeys);
    binder.bind(form.ModemConnectionFrame, dial, nullptr);
    layout->addWidget(dial);

    auto* keys = new QHBoxLayout;
    for (Button* control : {&form.LoadSettingsButton, &form.SaveSettingsButton})
        keys->addWidget(button(*control));
    keys->addStretch(1);
    for (Button* control : {&form.ZELButton, &form.DisconnectButton, &form.DisconnectButton2,
                            &form.CancelConnButton, &form.CancelConnButton1})
        keys->addWidget(button(*control));
    static_cast<QPushButton*>(binder.widgetOf(form.ZELButton))->setDefault(true);
    layout->addStretch(1);
    busy_ = new QProgressBar;
    busy_->setRange(0, 0);
    busy_->setTextVisible(false);
    busy_->setFixedHeight(6);
    QSizePolicy policy = busy_->sizePolicy();
    policy.setRetainSizeWhenHidden(true);  // nothing moves when the work begins
    busy_->setSizePolicy(policy);
    layout->addWidget(busy_);
    layout->addLayout(keys);
    layout->setSizeConstraint(QLayout::SetMinimumSize);
    followForm();
}

}  // namespace zel
