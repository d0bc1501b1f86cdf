#include "desktop/windows/Terminators.h"

#include <QApplication>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QRegularExpression>
#include <QShortcut>
#include <cstddef>
#include <string_view>
#include <vector>

#include "desktop/binders/Binder.h"
#include "desktop/binders/ShortcutTable.h"
#include "forms/ControllerForm.h"
#include "model/ZEL3Variables.h"
#include "panel/EntryText.h"
#include "panel/SoftPositions.h"
#include "platform/Controls.h"
#include "platform/Form.h"
#include "support/AtEnd.h"

namespace zel {
namespace {

using CF = ControllerForm;

const std::vector<Terminator> kHertz = {
    {"GHz", "G", 'G'}, {"MHz", "M", 'M'}, {"kHz", "k", 'K'}, {"Hz", "", 0}};
const std::vector<Terminator> kSeconds = {{"s", "", 0}, {"ms", "m", 'M'}, {"µs", "u", 'U'}};
const std::vector<Terminator> kWholeSeconds = {{"s", "", 0}};
const std::vector<Terminator> kLevel = {{"dBm", "", 0}};
const std::vector<Terminator> kPercent = {{"%", "", 0}};
const std::vector<Terminator> kDecibels = {{"dB", "", 0}};
const std::vector<Terminator> kMetres = {{"m", "", 0}};
const std::vector<Terminator> kLengths = {{"m", "", 0}, {"cm", "cm", 'C'}, {"mm", "mm", 'M'}};
const std::vector<Terminator> kEnter = {{"Enter", "", 0}};

}  // namespace

EntryUnit entryUnitOf(const ControllerForm& panel, const ZEL3Variables& mirror, int position) {
    const SoftPosition* row = softPosition(panel.State, position);
    if (row == nullptr) return EntryUnit::Enter;
    switch (row->entryUnit) {
        case EntryUnit::MarkerX:
            if (panel.InstrumentMode == CF::DISTTOFAULTMEASURE) return EntryUnit::Metres;
            return mirror.Span != 0 ? EntryUnit::Hertz : EntryUnit::Seconds;
        case EntryUnit::TriggerValue:
            return panel.TriggerKeyIsLevel ? EntryUnit::Percent : EntryUnit::Seconds;
        default:
            return row->entryUnit;
    }
}

const std::vector<Terminator>& terminatorsOf(const ControllerForm& panel,
                                             const ZEL3Variables& mirror, int position) {
    const SoftPosition* row = softPosition(panel.State, position);
    switch (entryUnitOf(panel, mirror, position)) {
        case EntryUnit::Hertz:
            return kHertz;
        case EntryUnit::Seconds:
            return kSeconds;
        case EntryUnit::WholeSeconds:
            return kWholeSeconds;
        case EntryUnit::Level:
            return kLevel;
        case EntryUnit::Percent:
            return kPercent;
        case EntryUnit::Decibels:
            return kDecibels;
        case EntryUnit::Metres:
            return row->entryUnit == EntryUnit::MarkerX ? kLengths : kMetres;
        default:
            return kEnter;
    }
}

bool isBareNumber(const QString& text) {
    static const QRegularExpression number(R"(^\s*[-+]?(\d+(\.\d*)?|\.\d+)(E[-+]?\d+)?\s*$)",
                                           QRegularExpression::CaseInsensitiveOption);
    return number.match(text).hasMatch();
}

TerminatorRow::TerminatorRow(ControllerForm& panel, const ZEL3Variables& mirror, Binder& binder,
                             QWidget* parent)
    : QWidget(parent), panel_(panel), mirror_(mirror), binder_(binder) {
    setObjectName("TerminatorRow");
    auto* layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(3);
    for (std::size_t i = 0; i < keys_.size(); ++i) {
        auto* key = new QPushButton;
        key->setProperty("face", "terminator");
        key->setMinimumWidth(0);
        key->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Fixed);
        // The box keeps the focus; from the keyboard the letters with Alt do the same.
        key->setFocusPolicy(Qt::NoFocus);
        QSizePolicy policy = key->sizePolicy();
        policy.setRetainSizeWhenHidden(true);
        key->setSizePolicy(policy);
        connect(key, &QPushButton::clicked, this, [this, i] { press(i); });
        layout->addWidget(key, 1);
        keys_.at(i) = key;
    }
    connect(qApp, &QApplication::focusChanged, this, [this] { refresh(); });
    followPositions();
    refresh();
}

void TerminatorRow::followPositions() {
    changed_.setSingleShot(true);
    connect(&changed_, &QTimer::timeout, this, [this] { refresh(); });
    const auto follow = [this](Control& control) {
        control.Changed.connect([self = QPointer<TerminatorRow>(this)] {
            if (self && !self->changed_.isActive()) self->changed_.start(0);
        });
    };
    for (int i = 0; i < panel_.SoftKey.count(); ++i) {
        follow(panel_.SoftKey(i));
        follow(panel_.SoftTextBox(i));
    }
    follow(panel_.StopButton);  // a view that begins or ends has another menu than before
    // A connection that comes back finds its texts as they were, and gives them their menu again.
    follow(panel_.ConnectedPic);
}

// Keys of a grey box are grey with it.
bool TerminatorRow::eventFilter(QObject* watched, QEvent* event) {
    if (event->type() == QEvent::EnabledChange && !changed_.isActive()) changed_.start(0);
    return QWidget::eventFilter(watched, event);
}

PanelLineEdit* TerminatorRow::boxOf(int position) const {
    return static_cast<PanelLineEdit*>(
        qobject_cast<QLineEdit*>(binder_.widgetOf(panel_.SoftTextBox(position))));
}

int TerminatorRow::position() const {
    const auto takes = [this](int i) {
        const TextBox& box = panel_.SoftTextBox(i);
        return box.Visible && box.Enabled && !box.Locked && panel_.SoftFrame(i).Visible;
    };
    int red = -1;
    int first = -1;
    for (int i = panel_.SoftTextBox.count() - 1; i >= 0; --i) {
        if (!takes(i)) continue;
        if (const QWidget* box = boxOf(i); box != nullptr && box->hasFocus()) return i;
        if (panel_.SoftKey(i).BackColor == kRed) red = i;
        first = i;
    }
    return red >= 0 ? red : first;
}

void TerminatorRow::refresh() {
    const int at = position();
    static const std::vector<Terminator> none;
    const std::vector<Terminator>& terminators = at < 0 ? none : terminatorsOf(panel_, mirror_, at);
    PanelLineEdit* box = at < 0 ? nullptr : boxOf(at);
    if (box != nullptr) {
        box->removeEventFilter(this);  // one is enough
        box->installEventFilter(this);
    }
    for (std::size_t i = 0; i < keys_.size(); ++i) {
        QPushButton& key = *keys_.at(i);
        key.setVisible(i < terminators.size());
        if (i >= terminators.size()) continue;
        key.setEnabled(box == nullptr || box->isEnabled());
        const Terminator& row = terminators[i];
        key.setText(row.caption);
        const QString keys = row.letter != 0 ? QString("Alt+") + row.letter : QString("Enter");
        key.setToolTip(
            QObject::tr("Ends the number in %1 (%2)").arg(QString::fromUtf8(row.caption), keys));
        if (std::string_view(row.caption) == "Enter")
            key.setToolTip(QObject::tr("Sends the entry (Enter)"));
        key.setAccessibleName(row.caption);
    }
}

void TerminatorRow::press(std::size_t index) {
    const int at = position();
    if (at < 0) return;
    const std::vector<Terminator>& terminators = terminatorsOf(panel_, mirror_, at);
    if (index >= terminators.size()) return;
    PanelLineEdit* box = boxOf(at);
    if (!box->isEnabled()) return;
    box->setFocus(Qt::OtherFocusReason);
    // A value that was only read is not sent again, and a unit alone is no value.
    const bool typed = panel_.SoftBoxFirstKey != 1 && !box->text().isEmpty();
    const bool plainEntry = &terminators == &kEnter;
    if (const EntryReading number = readEntry(box->text().toStdString(), EntryUnit::Enter);
        typed && !plainEntry && number.ok && number.text != box->text().toStdString())
        panel_.SoftTextBox(at).Text = number.text;
    binder_.flush();
    if (!typed || (!plainEntry && !isBareNumber(box->text()))) return box->selectAll();
    const QString unit = terminators[index].typed;
    box->deselect();
    box->end(false);
    for (const QChar letter : unit) {
        QKeyEvent key(QEvent::KeyPress, letter.toUpper().unicode(), Qt::NoModifier,
                      QString(letter));
        QApplication::sendEvent(box, &key);
    }
    QKeyEvent enter(QEvent::KeyPress, Qt::Key_Return, Qt::NoModifier, "\r");
    QApplication::sendEvent(box, &enter);
}

void TerminatorRow::pressLetter(char letter) {
    const int at = position();
    if (at < 0) return;
    const std::vector<Terminator>& terminators = terminatorsOf(panel_, mirror_, at);
    for (std::size_t i = 0; i < terminators.size(); ++i)
        if (terminators[i].letter == letter) return press(i);
}

void TerminatorRow::buildShortcuts(QWidget& window) {
    for (const char* letter = kTerminatorLetters; *letter != 0; ++letter) {
        auto* shortcut =
            new QShortcut(QKeySequence(QString("Alt+") + QLatin1Char(*letter)), &window);
        shortcut->setAutoRepeat(false);
        connect(shortcut, &QShortcut::activated, this, [this, key = *letter] { pressLetter(key); });
    }
}

bool TerminatorRow::typeAhead(const QKeyEvent& event) {
    static const QString entry = "0123456789.-+";
    const bool plain = (event.modifiers() & (Qt::ControlModifier | Qt::AltModifier)) == 0;
    if (!plain || event.text().size() != 1 || !entry.contains(event.text())) return false;
    const int at = position();
    if (at < 0 || (binder_.refuses && binder_.refuses(panel_.SoftTextBox(at)))) return false;
    PanelLineEdit* box = boxOf(at);
    // A grey box hands the key up to the window, which would send it here again.
    static bool sending = false;
    if (sending || box == nullptr || !box->isVisible() || !box->isEnabled()) return false;
    sending = true;
    const AtEnd sent([] { sending = false; });
    box->setFocus(Qt::OtherFocusReason);
    QKeyEvent key(QEvent::KeyPress, event.key(), event.modifiers(), event.text());
    QApplication::sendEvent(box, &key);
    return true;
}

}  // namespace zel
