#include "desktop/platform/KeyCodes.h"

#include <QKeyEvent>

#include "platform/Controls.h"

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

}  // namespace

int keyCodeOf(const QKeyEvent& event) {
    for (const KeyRow& row : kKeys)
        if (row.qtKey == event.key()) return row.code;
    const bool named = (event.key() >= Qt::Key_A && event.key() <= Qt::Key_Z) ||
                       (event.key() >= Qt::Key_0 && event.key() <= Qt::Key_9) ||
                       event.key() == Qt::Key_Space;
    return named ? event.key() : 0;
}

}  // namespace zel
