#include "desktop/windows/FormWindow.h"

#include <QCloseEvent>
#include <QFormLayout>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QPointer>
#include <QVBoxLayout>
#include <algorithm>
#include <functional>
#include <optional>

#include "desktop/binders/Binder.h"
#include "desktop/binders/OwnTexts.h"
#include "desktop/binders/ToolTips.h"
#include "desktop/windows/ConnectCard.h"
#include "forms/MainForm.h"
#include "panel/EntryText.h"
#include "panel/SoftPositions.h"
#include "platform/Controls.h"
#include "platform/Form.h"
#include "platform/LinkAddress.h"
#include "platform/Pointer.h"
#include "support/NumberText.h"

namespace zel {
namespace {

struct Field {
    const char* control;
    const char* caption;  ///< empty where a label of the form says it
    const char* unit = "";
    /// Of a number; nothing for a text.
    std::optional<EntryUnit> number = std::nullopt;
    bool aboveZero = false;
};
constexpr Field kFields[] = {
    {"manualSizeMin", "Minimum", "", EntryUnit::Enter},
    {"manualSizeMax", "Maximum", "", EntryUnit::Enter},
    {"TimeIntervalBox", "", "s", EntryUnit::WholeSeconds, true},
};

Field fieldOf(const Control& control) {
    for (const Field& row : kFields)
        if (control.name() == row.control) return row;
    return {control.name().c_str(), control.name().c_str()};
}

/// Why a field's text cannot be taken; empty when it can.
QString problemOf(const Field& field, const QString& text) {
    if (!field.number) return {};
    const EntryReading reading = readEntry(text.toStdString(), *field.number);
    if (!reading.ok) return ownText(reading.problem);
    return field.aboveZero && !(reading.value > 0) ? QObject::tr("It is to be more than 0")
                                                   : QString();
}

/// Buttons that leave a dialog without doing what it is for.
constexpr const char* kCancels[] = {"cmdCancel", "CancelTimeButton", "ClosePwrForm"};

constexpr int kFieldWidth = 260;
constexpr int kAdviceWidth = 380;

/// A line of more than one row, which needs its room from the start.
QLabel* adviceLine(Label& control, Binder& binder) {
    auto* label = new QLabel;
    label->setWordWrap(true);
    label->setTextFormat(Qt::PlainText);
    label->setMinimumWidth(kAdviceWidth);
    label->setMinimumHeight(3 * label->fontMetrics().lineSpacing());
    label->setAlignment(Qt::AlignLeft | Qt::AlignTop);
    binder.bind(control, label);
    return label;
}

}  // namespace

FormWindow::FormWindow(Form& form, Binder& binder, QWidget* parent)
    : QDialog(parent), form_(form), binder_(binder) {
    setProperty("form", QString::fromStdString(form.name()));  // F1 opens its topic
    setObjectName(QString::fromStdString(form.name()));
    setWindowFlag(Qt::WindowContextHelpButtonHint, false);
    shown_.setSingleShot(true);
    connect(&shown_, &QTimer::timeout, this, [this] { focusFirst(); });
}

void FormWindow::followForm() {
    binder_.bindForm(form_, this, [this] {
        setWindowTitle(QString::fromStdString(form_.Caption));
        if (!form_.Visible) putAway_ = false;
        const bool shown = form_.Visible && !putAway_;
        const bool busy = form_.MousePointer == kHourglass;
        setCursor(busy ? Qt::BusyCursor : Qt::ArrowCursor);
        if (busy_ != nullptr) busy_->setVisible(busy);
        if (shown == isVisible()) return;
        if (shown) {
            setWindowModality(form_.Modal ? Qt::ApplicationModal : Qt::NonModal);
            show();
            raise();
            activateWindow();
            // After the texts of this frame, which would take the selection away.
            shown_.start(0);
        } else {
            hide();
        }
    });
}

void FormWindow::setPutAway(bool away) {
    putAway_ = away;
    binder_.refresh(form_);
}

void FormWindow::closeEvent(QCloseEvent* event) {
    int cancel = 0;
    form_.QueryUnload(cancel);
    if (cancel != 0) return event->ignore();
    form_.unload(0);
    event->accept();
}

void FormWindow::reject() {
    for (const Button* button : cancels_) {
        auto* key = qobject_cast<QPushButton*>(binder_.widgetOf(*button));
        if (key != nullptr && key->isVisible() && key->isEnabled()) return key->click();
    }
    close();
}

void FormWindow::focusFirst() {
    for (const Control* control : form_.controls()) {
        auto* widget = qobject_cast<QWidget*>(binder_.widgetOf(*control));
        if (widget == nullptr || !widget->isVisible() || !widget->isEnabled()) continue;
        const auto* line = qobject_cast<QLineEdit*>(widget);
        const auto* list = qobject_cast<QComboBox*>(widget);
        // From a list without entries nothing can be chosen.
        const bool entry = (line != nullptr && !line->isReadOnly()) ||
                           (list != nullptr && (list->isEditable() || list->count() > 0)) ||
                           (control->kind() == ControlKind::OptionButton &&
                            static_cast<const OptionButton*>(control)->Value());
        if (!entry) continue;
        widget->setFocus(Qt::TabFocusReason);
        if (auto* field = qobject_cast<QLineEdit*>(widget); field != nullptr) field->selectAll();
        return;
    }
    for (QPushButton* button : findChildren<QPushButton*>())
        if (button->isDefault() && button->isVisible()) button->setFocus(Qt::TabFocusReason);
}

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
    layout->setSpacing(10);
    layout->setContentsMargins(14, 12, 14, 12);
    layout->addLayout(fields);
    QLabel* caption = nullptr;
    for (Control* control : form.controls()) {
        if (control->name() == "AdviceLabel") {
            layout->addWidget(adviceLine(static_cast<Label&>(*control), binder));
        } else if (control->kind() == ControlKind::Label) {
            caption = new QLabel;
            binder.bind(static_cast<Label&>(*control), caption);
        } else if (control->kind() == ControlKind::TextBox) {
            const Field field = fieldOf(*control);
            auto* line = new PanelLineEdit;
            auto* row = new QHBoxLayout;
            row->addWidget(line, 1);
            if (*field.unit != 0) {
                row->addWidget(new QLabel(field.unit));
            } else {
                line->setMinimumWidth(kFieldWidth);
            }
            if (caption == nullptr) caption = new QLabel(field.caption);
            caption->setBuddy(line);
            fields->addRow(caption, row);
            caption = nullptr;
            binder.bind(static_cast<TextBox&>(*control), line);
            checkField(*line, [field](const QString& text) { return problemOf(field, text); });
        } else if (control->kind() == ControlKind::OptionButton) {
            auto* option = new QRadioButton;
            layout->addWidget(option);
            binder.bind(static_cast<OptionButton&>(*control), option);
        } else if (control->kind() == ControlKind::Button) {
            auto* button = new QPushButton;
            button->setAutoDefault(false);
            button->setMinimumWidth(90);
            if (buttons->count() == 1) {  // after the stretch
                button->setDefault(true);
                accept_ = control;
            }
            buttons->addWidget(button);
            binder.bind(static_cast<Button&>(*control), button);
            for (const char* name : kCancels)
                if (control->name() == name) setCancel(static_cast<Button&>(*control));
        }
    }
    layout->addStretch(1);
    layout->addLayout(buttons);
    followForm();
}

void FormWindow::checkField(PanelLineEdit& line, std::function<QString(const QString&)> problem) {
    connect(&line, &QLineEdit::textChanged, this,
            [this, field = &line, problem](const QString& text) {
                field->showProblem(problem(text));
                checkFields();
            });
    checked_.push_back([field = &line, problem] { return problem(field->text()); });
}

void FormWindow::checkField(QComboBox& list, std::function<QString(const QString&)> problem) {
    connect(&list, &QComboBox::editTextChanged, this,
            [this, field = &list, problem](const QString& text) {
                setMark(field, "refused", !problem(text).isEmpty());
                checkFields();
            });
    checked_.push_back([field = &list, problem] { return problem(field->currentText()); });
}

void FormWindow::checkFields() {
    if (accept_ == nullptr) return;
    QString problem;
    for (const auto& check : checked_)
        if (problem.isEmpty()) problem = check();
    binder_.block(*accept_, problem.toStdString());
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
        constexpr int kAroundText = 28;  // px
        const QString words = ownCaption(control, control.Caption);
        key->setMinimumWidth(
            std::max(100, key->fontMetrics().horizontalAdvance(words) + kAroundText));
        binder.bind(control, key);
        return key;
    };

    auto* serial = new QGroupBox(QObject::tr("Serial port"));
    auto* serialFields = new QFormLayout(serial);
    serialFields->addRow(QObject::tr("Port"), list(form.COMList));
    QComboBox* baud = list(form.BaudList);
    setAccept(form.ZELButton);
    checkField(*baud, [](const QString& text) {
        const QString digits = text.trimmed().remove(',');
        return digits.isEmpty() || wholeNumber(digits.toStdString(), 1, kFastestBaud)
                   ? QString()
                   : QObject::tr("The baud rate is a whole number");
    });
    serialFields->addRow(QObject::tr("Baud rate"), baud);
    auto* portState = new QLabel(QObject::tr("The port is open"));
    serialFields->addRow("", portState);
    serialFields->addRow(QObject::tr("Instrument"), box(form.IDText));
    binder.bind(form.DirectConnectionFrame, serial, nullptr);
    binder.bindShow(form.OnPic, portState,
                    [&form, portState] { portState->setVisible(form.OnPic.Visible); });
    layout->addWidget(serial);

    auto* dial = new QGroupBox(QObject::tr("Dial"));
    auto* dialFields = new QFormLayout(dial);
    dialFields->addRow(QObject::tr("Number"), box(form.TelNumberBox));
    dialFields->addRow(QObject::tr("Modem"), box(form.AirBaudRateText));
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
    for (Button* control :
         {&form.SearchRatesButton, &form.ZELButton, &form.DisconnectButton, &form.DisconnectButton2,
          &form.CancelConnButton, &form.CancelConnButton1})
        keys->addWidget(button(*control));
    static_cast<QPushButton*>(binder.widgetOf(form.ZELButton))->setDefault(true);
    // While it dials, Esc ends the dialling.
    for (const Button* control :
         {&form.CancelButton, &form.CancelConnButton, &form.CancelConnButton1})
        setCancel(*control);
    layout->addWidget(adviceLine(form.AdviceLabel, binder));
    layout->addStretch(1);
    busy_ = new QProgressBar;
    busy_->setRange(0, 0);
    busy_->setTextVisible(false);
    busy_->setFixedHeight(6);
    QSizePolicy policy = busy_->sizePolicy();
    policy.setRetainSizeWhenHidden(true);  // nothing moves when the work begins
    busy_->setSizePolicy(policy);
    layout->addWidget(busy_);
    form.AdviceLabel.Changed.connect([bar = QPointer<QProgressBar>(busy_), &form] {
        if (bar) showWait(*bar, form.AdviceLabel.Caption);
    });
    layout->addLayout(keys);
    layout->setSizeConstraint(QLayout::SetMinimumSize);
    // Of what the form says; "Disconnect" without a connection would only show a box.
    const auto noteConnection = [self = QPointer<ConnectionWindow>(this), &form] {
        if (!self) return;
        const bool begun = form.OnPic.Visible || form.IsConnectedToPort || form.ModemConnected ||
                           form.Attempting || form.Searching;
        const std::string reason = begun ? "" : QObject::tr("Not connected").toStdString();
        for (const Button* key : {&form.DisconnectButton, &form.DisconnectButton2})
            self->binder_.block(*key, reason);
    };
    form.OnPic.Changed.connect(noteConnection);
    form.AdviceLabel.Changed.connect(noteConnection);
    form.Changed.connect(noteConnection);
    noteConnection();
    followForm();
}

// As high as the page on show needs: that of the serial port and that of the modem differ.
bool ConnectionWindow::event(QEvent* event) {
    const bool taken = FormWindow::event(event);
    if (event->type() != QEvent::LayoutRequest || layout() == nullptr) return taken;
    const int wanted = layout()->hasHeightForWidth() ? layout()->totalHeightForWidth(width())
                                                     : layout()->totalSizeHint().height();
    if (height() != wanted) resize(width(), wanted);
    return taken;
}

}  // namespace zel
