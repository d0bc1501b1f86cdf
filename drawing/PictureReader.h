#pragma once
// Reads a picture as data, as the console writes it, back into the forms that the drawing takes.

#include <QByteArray>
#include <QString>

#include "forms/Forms.h"
#include "trace/ViewAnnotations.h"
#include "waterfall/SweepHistory.h"
#include "waterfall/WaterfallPicture.h"

namespace zel {

enum class DrawnKind { Graph, Waterfall, Spectrogram };

struct DrawnPicture {
    DrawnKind kind = DrawnKind::Graph;
    Forms forms;
    ViewAnnotations annotations;
    PictureStyle style;
    SweepHistory history{forms};
};

/// Fills `picture`. The text is empty, or says what is wrong and where: "values: is no list". A
/// member that is missing keeps its initial value; one of another type, a list that is too long
/// and a version that is not known are wrong.
QString readPicture(const QByteArray& json, DrawnPicture& picture);

}  // namespace zel
