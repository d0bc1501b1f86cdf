#include <QKeyEvent>

#include "desktop/binders/Binder.h"

namespace zel {
namespace {

struct KeyRow {
    int qtKey;
    int code;
};
constexpr KeyRow kKeys[] = {
    {Qt::Key_Backspace, kKeyBackspace},
    {Qt::Key_Clear, kKeyClear},
    {Qt::Key_Return, kKeyEnter},
    {Qt::Key_Enter, kKeyEnter},
    {Qt::Key_Left, kKeyLeft},
    {Qt::Key_Right, kKeyRight},
    {Qt::Key_F1, kKeyF1},
};

int codeOf(const QKeyEvent& event) {
    for (const KeyRow& row : kKeys)
        if (row.qtKey == event.key()) return row.code;
    const bool named = (event.key() >= Qt::Key_A && event.key() <= Qt::Key_Z) ||
                       (event.key() >= Qt::Key_0 && event.key() <= Qt::Key_9) ||
                       event.key() == Qt::Key_Space;
    return named ? event.key() : 0;
}

/// The character that a key puts into the text: code points, and the two that handlers know.
int characterOf(const QKeyEvent& event, int code) {
    if (code == kKeyEnter || code == kKeyBackspace) return code;
    const QList<uint> points = event.text().toUcs4();
    return points.size() == 1 && points[0] >= 32 && points[0] != 127 ? static_cast<int>(points[0])
                                                                     : 0;
}

}  // namespace

void PanelLineEdit::setControl(TextBox* control, std::function<bool()> refused) {
    control_ = control;
    refused_ = std::move(refused);
}

void PanelLineEdit::keyPressEvent(QKeyEvent* event) {
    if (control_ == nullptr || isReadOnly()) return QLineEdit::keyPressEvent(event);
    if (refused_ && refused_()) return;
    const int code = codeOf(*event);
    control_->KeyDown(code, event->modifiers().testFlag(Qt::ShiftModifier) ? 1 : 0);
    int character = characterOf(*event, code);
    if (character != 0) {
        control_->KeyPress(character);
        // A handler may have emptied the box, or set a whole new text behind an Enter.
        const QString shown = QString::fromStdString(control_->Text);
        if (text() != shown) setText(shown);
        if (character == 0) return;
        if (code == kKeyEnter) {
            selectAll();
            return;
        }
    }
    QLineEdit::keyPressEvent(event);
}

}  // namespace zel
