#include <QKeyEvent>
#include <QToolTip>
#include <functional>
#include <string>
#include <utility>

#include "desktop/binders/Binder.h"
#include "desktop/platform/KeyCodes.h"
#include "desktop/style/PanelStyle.h"
#include "platform/Controls.h"

namespace zel {
namespace {

/// The character that a key puts into the text: code points, and the two that handlers know.
int characterOf(const QKeyEvent& event, int code) {
    if (code == kKeyEnter || code == kKeyBackspace) return code;
    const QList<uint> points = event.text().toUcs4();
    return points.size() == 1 && points[0] >= 32 && points[0] != 127 ? static_cast<int>(points[0])
                                                                     : 0;
}

struct KeyName {
    int code;
    const char* name;
};
/// Keys without a character of the text that handlers know.
constexpr KeyName kTold[] = {
    {kKeyBackspace, "backspace"}, {kKeyClear, "clear"}, {kKeyLeft, "left"}, {kKeyRight, "right"}};

std::string utf8Of(int character) {
    const auto point = static_cast<char32_t>(character);
    return QString::fromUcs4(&point, 1).toStdString();
}

/// The text after a key at its end.
std::string after(const std::string& text, int character) {
    if (character != kKeyBackspace) return text + utf8Of(character);
    QString shown = QString::fromStdString(text);
    if (!shown.isEmpty()) shown.chop(shown.back().isLowSurrogate() ? 2 : 1);
    return shown.toStdString();
}

}  // namespace

PanelLineEdit::PanelLineEdit(QWidget* parent) : QLineEdit(parent) {
    // What is dropped would pass the keys by; a file is for the window.
    setAcceptDrops(false);
    connect(this, &QLineEdit::textChanged, this, [this] { showProblem({}); });
}

void PanelLineEdit::setControl(TextBox* control, std::function<bool()> refused,
                               std::function<bool(std::function<void()>)> enter, Tell tell) {
    control_ = control;
    tell_ = std::move(tell);
    refused_ = std::move(refused);
    enter_ = std::move(enter);
}

void PanelLineEdit::keyPressEvent(QKeyEvent* event) {
    if (control_ == nullptr || isReadOnly()) return QLineEdit::keyPressEvent(event);
    if (refused_ && refused_()) return;
    if (event->matches(QKeySequence::Paste) || event->matches(QKeySequence::Cut) ||
        event->matches(QKeySequence::Undo) || event->matches(QKeySequence::Redo))
        return QLineEdit::keyPressEvent(event);
    const bool enters = keyCodeOf(*event) == kKeyEnter;
    if (enters && !readable()) return;
    if (enters && enter_ && enter_([control = control_] {
            int key = kKeyEnter;
            control->KeyDown(key, 0);
            control->KeyPress(key);
        }))
        return;
    typing_ = true;
    insertKey(event);
    typing_ = false;
}

bool PanelLineEdit::readable() {
    if (!reader_ || text().isEmpty()) return true;
    QString made = text();
    QString problem;
    if (!reader_(made, problem)) {
        showProblem(problem);
        return false;
    }
    if (made == text()) return true;
    setText(made);
    control_->Text = made.toStdString();
    return true;
}

void PanelLineEdit::showProblem(const QString& problem) {
    const bool marked = !problem.isEmpty();
    if (marked == marked_ && !marked) return;
    if (!marked_) ownTip_ = toolTip();
    marked_ = marked;
    setProperty("refused", marked);
    restyle(*this);
    setToolTip(marked ? problem : ownTip_);
    // What was mended needs its reason no more.
    if (!marked) QToolTip::hideText();
    if (marked && hasFocus()) QToolTip::showText(mapToGlobal(QPoint(0, height())), problem, this);
}

void PanelLineEdit::takeOver(const std::string& edited) {
    // A paste does not come by the keys; it edits the text, which then is to stay.
    if (!typing_) {
        tell_("key", "right");
        control_->KeyDown(kKeyRight, 0);
    }
    if (!typing_ || typed_ != edited) tell_("set", edited);
    control_->Text = edited;
}

void PanelLineEdit::tellKey(int code, int character) {
    for (const KeyName& key : kTold)
        if (key.code == code) return tell_("key", key.name);
    if (character != 0 && code != kKeyEnter) tell_("type", utf8Of(character));
}

void PanelLineEdit::insertKey(QKeyEvent* event) {
    const int code = keyCodeOf(*event);
    int character = characterOf(*event, code);
    tellKey(code, character);
    typed_.reset();
    control_->KeyDown(code, event->modifiers().testFlag(Qt::ShiftModifier) ? 1 : 0);
    if (character != 0) {
        control_->KeyPress(character);
        // A handler may have emptied the box, or set a whole new text after an Enter.
        const QString shown = QString::fromStdString(control_->Text);
        if (text() != shown) setText(shown);
        if (character == 0) return;
        if (code == kKeyEnter) {
            selectAll();
            // Nobody waits for it here: the window may have a key for it.
            if (!control_->KeyPress.connected()) event->ignore();
            return;
        }
        typed_ = after(control_->Text, character);
    }
    QLineEdit::keyPressEvent(event);
}

}  // namespace zel
