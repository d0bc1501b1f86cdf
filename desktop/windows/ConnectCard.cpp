#include "desktop/windows/ConnectCard.h"

#include <QHBoxLayout>
#include <QKeyEvent>
#include <QPointer>
#include <QRegularExpression>
#include <QVBoxLayout>
#include <algorithm>
#include <string>
#include <utility>

#include "desktop/binders/Binder.h"
#include "desktop/binders/OwnTexts.h"
#include "desktop/binders/ToolTips.h"
#include "desktop/platform/SimulatorChild.h"
#include "forms/Forms.h"
#include "platform/Form.h"

namespace zel {
namespace {

constexpr int kWidth = 440;
constexpr int kBarHeight = 6;
constexpr int kStepLines = 3;
constexpr int kKeyWidth = 96;    // px, at least
constexpr int kAroundText = 28;  // px

}  // namespace

void showWait(QProgressBar& bar, const std::string& step) {
    static const QRegularExpression seconds(", (\\d+) of (\\d+) s$");
    const auto match = seconds.match(QString::fromStdString(step));
    bar.setRange(0, match.hasMatch() ? match.captured(2).toInt() : 0);
    bar.setValue(match.hasMatch() ? match.captured(1).toInt() : 0);
}

ConnectCard::ConnectCard(Forms& forms, Binder& binder, Ways ways, QWidget* parent)
    : QFrame(parent),
      forms_(forms),
      binder_(binder),
      ways_(std::move(ways)),
      heading_(new QLabel),
      step_(new QLabel),
      wait_(new QProgressBar),
      cancel_(new QPushButton(QObject::tr("Cancel"))),
      again_(new QPushButton(QObject::tr("Try Again"))),
      search_(new QPushButton(
          ownCaption(forms.main.SearchRatesButton, forms.main.SearchRatesButton.Caption))),
      close_(new QPushButton(QObject::tr("Close"))) {
    setObjectName("card");
    setFixedWidth(kWidth);
    setAccessibleName(QObject::tr("Connecting"));
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(16, 14, 16, 16);
    layout->setSpacing(8);
    heading_->setProperty("readout", true);
    for (QLabel* label : {heading_, step_}) {
        label->setTextFormat(Qt::PlainText);
        label->setWordWrap(true);
        layout->addWidget(label);
    }
    step_->setAlignment(Qt::AlignLeft | Qt::AlignTop);
    wait_->setTextVisible(false);
    wait_->setFixedHeight(kBarHeight);
    wait_->setAccessibleName(QObject::tr("Progress of the connection"));
    layout->addWidget(wait_);
    auto* keys = new QHBoxLayout;
    keys->addStretch(1);
    for (QPushButton* key : {again_, search_, close_, cancel_}) keys->addWidget(key);
    layout->addLayout(keys);
    connect(cancel_, &QPushButton::clicked, this, [this] { cancel(); });
    connect(again_, &QPushButton::clicked, this, [this] { ways_.again(); });
    connect(search_, &QPushButton::clicked, this, [this] { click(forms_.main.SearchRatesButton); });
    connect(close_, &QPushButton::clicked, this, [this] {
        putAway_ = true;
        take();
    });
    for (Control* control : {static_cast<Control*>(&forms.main.AdviceLabel),
                             static_cast<Control*>(&forms.main.SearchRatesButton),
                             static_cast<Control*>(&forms.tcpConnection.AdviceLabel),
                             static_cast<Control*>(&forms.controller.ConnectedPic)})
        control->Changed.connect([self = QPointer<ConnectCard>(this)] {
            if (self) self->take();
        });
    for (Form* form : {static_cast<Form*>(&forms.main), static_cast<Form*>(&forms.tcpConnection)})
        form->Changed.connect([self = QPointer<ConnectCard>(this)] {
            if (self) self->take();
        });
    hide();
}

bool ConnectCard::connecting() const {
    return forms_.main.Attempting || forms_.main.Searching || forms_.tcpConnection.Connecting;
}

QString ConnectCard::heading() const {
    using CF = ControllerForm;
    if (forms_.controller.ConnectionState == CF::TCPCON)
        return QString::fromStdString(forms_.tcpConnection.IPAdressTextBox.Text.get() + ":" +
                                      forms_.tcpConnection.RemotePortTextBox.Text.get());
    const QString port = QString::fromStdString(forms_.main.COMList.Text());
    if (port.contains(SimulatorChild::kLinkName)) return QObject::tr("Simulated instrument");
    return QObject::tr("%1, %2 baud")
        .arg(port, QString::fromStdString(forms_.main.BaudList.Text()));
}

/// Once, and not at the start: the first text that is measured waits for the fonts.
void ConnectCard::giveRoom() {
    if (std::exchange(roomGiven_, true)) return;
    step_->setMinimumHeight(kStepLines * step_->fontMetrics().lineSpacing());
    for (QPushButton* key : {again_, search_, close_, cancel_})
        key->setMinimumWidth(
            std::max(kKeyWidth, key->fontMetrics().horizontalAdvance(key->text()) + kAroundText));
}

void ConnectCard::take() {
    const bool work = connecting();
    const QWidget* at = window()->focusWidget();
    const bool focused = at != nullptr && isAncestorOf(at);
    if (work) putAway_ = false;
    const bool dialog = forms_.main.Visible || forms_.tcpConnection.Visible;
    const MainForm& form = forms_.main;
    const bool failed = !work && form.SearchRatesButton.Visible && !putAway_ &&
                        !form.AdviceLabel.Caption.get().empty();
    const bool wanted = !forms_.controller.isConnected && !dialog && (work || failed);
    if (wanted) {
        giveRoom();
        const bool tcp = forms_.controller.ConnectionState == ControllerForm::TCPCON;
        const std::string step =
            tcp ? forms_.tcpConnection.AdviceLabel.Caption : form.AdviceLabel.Caption;
        heading_->setText(failed           ? QObject::tr("No instrument was found")
                          : form.Searching ? QObject::tr("Searching the baud rate")
                                           : QObject::tr("Connecting to %1").arg(heading()));
        step_->setText(ownText(step));
        showWait(*wait_, step);
        for (QPushButton* key : {again_, search_, close_}) key->setVisible(failed);
        cancel_->setVisible(work);
        wait_->setVisible(work);
        layout()->activate();  // the keys that came are in their places with this frame
    }
    if (wanted != wanted_) {
        wanted_ = wanted;
        if (ways_.changed) ways_.changed();
    }
    // The focus stays on the key that helps now, and goes to the graph at the end.
    if (wanted && failed != failed_) (failed ? search_ : cancel_)->setFocus(Qt::OtherFocusReason);
    if (wanted && work && !focused) cancel_->setFocus(Qt::OtherFocusReason);
    failed_ = failed;
    if (!wanted && focused) parentWidget()->setFocus(Qt::OtherFocusReason);
}

bool ConnectCard::event(QEvent* event) {
    if (event->type() == QEvent::ShortcutOverride &&
        static_cast<QKeyEvent*>(event)->key() == Qt::Key_Escape) {
        event->accept();
        return true;
    }
    return QFrame::event(event);
}

void ConnectCard::keyPressEvent(QKeyEvent* event) {
    if (event->key() != Qt::Key_Escape) return QFrame::keyPressEvent(event);
    (connecting() ? cancel_ : close_)->click();
}

void ConnectCard::cancel() {
    const bool tcp = forms_.controller.ConnectionState == ControllerForm::TCPCON;
    click(tcp ? forms_.tcpConnection.QuitTCPButton : forms_.main.CancelConnButton1);
}

void ConnectCard::click(Button& button) {
    if (binder_.tell) binder_.tell("click", button.form().name() + "." + button.name());
    const auto act = [&button] { button.Click(); };
    binder_.perform ? binder_.perform(button, act) : act();
}

}  // namespace zel
