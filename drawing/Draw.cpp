#include "drawing/Draw.h"

#include <memory>
#include <string>

#include "desktop/graph/GraphImage.h"
#include "desktop/graph/SpectrogramPicture.h"
#include "desktop/graph/WaterfallImage.h"
#include "drawing/PictureReader.h"
#include "forms/WaterfallForm.h"

namespace zel {

std::string drawPicture(QIODevice& input, const std::string& file) {
    // A pipe gives what has come, not all that will come.
    QByteArray bytes;
    while (bytes.size() <= kMostPictureBytes) {
        const QByteArray part = input.read(kMostPictureBytes + 1 - bytes.size());
        if (part.isEmpty()) break;
        bytes += part;
    }
    if (bytes.size() > kMostPictureBytes) return "the data is longer than 256 MB";
    const auto picture = std::make_unique<DrawnPicture>();
    QString problem = readPicture(bytes, *picture);
    if (!problem.isEmpty()) return problem.toStdString();
    const QString path = QString::fromStdString(file);
    const WaterfallForm& form = picture->forms.waterfall;
    switch (picture->kind) {
        case DrawnKind::Graph:
            saveGraphImage(picture->forms.controller.CWGraph1, picture->annotations, path,
                           &problem);
            break;
        case DrawnKind::Waterfall:
            saveWaterfallImage(form, picture->style, path, &problem);
            break;
        case DrawnKind::Spectrogram:
            saveSpectrogramImage(form, picture->history, path, &problem);
            break;
    }
    return problem.toStdString();
}

}  // namespace zel
