#pragma once
// The colours of a graph: on the screen and on paper.

#include <QColor>

#include "platform/Form.h"

namespace zel {

struct GraphColors {
    QColor background{0x0d, 0x12, 0x18};
    QColor plotArea{0x06, 0x09, 0x0d};
    QColor grid{0x35, 0x42, 0x50};
    QColor frame{0x7a, 0x8a, 0x9a};
    QColor text{0xd8, 0xe0, 0xe8};
    QColor trace{0xff, 0xd8, 0x4d};
    QColor trigger{0xff, 0x6b, 0x6b};
    QColor file{0x8e, 0xc9, 0xff};   ///< the name of a loaded file
    QColor shade{0x1d, 0x2b, 0x3d};  ///< a channel
    int cursorDarkness = 100;        ///< percent: cursors are made for a dark ground
};
GraphColors darkGraph();
GraphColors lightGraph();  ///< for paper

QColor colorOf(Color color);

}  // namespace zel
