#pragma once
// Reads a placeable Windows metafile and plays its records, with what a reader must be able to
// trust: sizes, handles, saved contexts.

#include <QByteArray>
#include <QColor>
#include <QPoint>
#include <QRect>
#include <optional>
#include <string>
#include <vector>

namespace zel {

struct PlayedPen {
    int style = 0;
    int width = 0;
    QColor color;
};

struct PlayedFont {
    int height = 0;
    int escapement = 0;
    int weight = 0;
    bool italic = false;
    std::string face;
};

/// One drawing record, with the context it was drawn in.
struct Drawn {
    enum class Kind { Polyline, Polygon, Rectangle, Ellipse, Text };
    Kind kind = Kind::Polyline;
    std::vector<QPoint> points;  ///< of a box: top left, bottom right; of a text: its origin
    std::string text;
    std::vector<int> advances;
    PlayedPen pen;
    std::optional<QColor> brush;
    PlayedFont font;
    QColor textColor;
    std::optional<QRect> clip;
    bool transparent = false;  ///< background mode
    int alignment = -1;
};

struct PlayedMetafile {
    std::vector<std::string> faults;  ///< what a reader would stumble over
    QRect box;
    int unitsPerInch = 0;
    QSize window;
    int handles = 0;
    int objectsMade = 0;
    std::vector<Drawn> drawn;

    std::vector<Drawn> of(Drawn::Kind kind) const;
    const Drawn* text(const std::string& wanted) const;
};

PlayedMetafile playMetafile(const QByteArray& file);

}  // namespace zel
