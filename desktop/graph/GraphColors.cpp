#include "desktop/graph/GraphColors.h"

#include "platform/Form.h"

namespace zel {

GraphColors darkGraph() { return {}; }

GraphColors lightGraph() {
    GraphColors colors;
    colors.background = Qt::white;
    colors.plotArea = Qt::white;
    colors.grid = QColor(0xc8, 0xce, 0xd4);
    colors.frame = QColor(0x40, 0x48, 0x50);
    colors.text = QColor(0x10, 0x14, 0x18);
    colors.trace = QColor(0x0b, 0x4f, 0xa8);
    colors.trigger = QColor(0xb0, 0x20, 0x20);
    colors.file = QColor(0x1d, 0x5c, 0xa0);
    colors.shade = QColor(0xe4, 0xec, 0xf6);
    colors.cursorDarkness = 170;
    return colors;
}

QColor colorOf(Color color) {
    return {static_cast<int>(color & 0xFF), static_cast<int>(color >> 8 & 0xFF),
            static_cast<int>(color >> 16 & 0xFF)};
}

}  // namespace zel
