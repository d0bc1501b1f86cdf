#include "desktop/graph/PictureFile.h"

#include <QApplication>
#include <QBuffer>
#include <QFileInfo>
#include <QImage>
#include <QPageSize>
#include <QPdfWriter>
#include <QSvgGenerator>
#include <cstddef>
#include <functional>

#include "desktop/platform/SystemFiles.h"
#include "platform/Files.h"

namespace zel {
namespace {

using Paint = std::function<void(QPainter&, const PictureKind&)>;

constexpr int kDotsPerInch = 96;
constexpr double kPointsPerInch = 72;
constexpr double kOversampling = 2;
constexpr const char* kTitle = "ZELRemote";

bool paintOn(QPaintDevice& device, const Paint& paint, const PictureKind& kind) {
    QPainter painter;
    if (!painter.begin(&device)) return false;
    paint(painter, kind);
    return painter.end();
}

bool png(QBuffer& buffer, QSize size, const Paint& paint, const PictureKind& kind) {
    QImage image(size * kind.dots, QImage::Format_RGB32);
    if (image.isNull()) return false;
    image.setDevicePixelRatio(kind.dots);
    image.fill(Qt::black);
    return paintOn(image, paint, kind) && image.save(&buffer, "PNG");
}

bool svg(QBuffer& buffer, QSize size, const Paint& paint, const PictureKind& kind) {
    QSvgGenerator generator;
    generator.setOutputDevice(&buffer);
    generator.setResolution(kDotsPerInch);
    generator.setSize(size);
    generator.setViewBox(QRect(QPoint(), size));
    generator.setTitle(kTitle);
    return paintOn(generator, paint, kind);
}

bool pdf(QBuffer& buffer, QSize size, const Paint& paint, const PictureKind& kind) {
    QPdfWriter writer(&buffer);
    writer.setResolution(kDotsPerInch);
    const QSizeF points = QSizeF(size) * kPointsPerInch / kDotsPerInch;
    writer.setPageSize(QPageSize(points, QPageSize::Point, kTitle, QPageSize::ExactMatch));
    writer.setPageMargins({});
    writer.setTitle(kTitle);
    writer.setCreator(kTitle);
    return paintOn(writer, paint, kind);
}

struct Row {
    const char* ending;
    bool (*write)(QBuffer& buffer, QSize size, const Paint& paint, const PictureKind& kind);
    PictureKind kind;
};
constexpr Row kRows[] = {
    {"png", png, {false, kOversampling}},
    {"svg", svg, {false, kOversampling}},
    {"pdf", pdf, {true, kOversampling}},
};

QString save(const QString& path, QSize size, const Paint& paint) {
    const QString ending = QFileInfo(path).suffix().toLower();
    for (const Row& row : kRows) {
        if (ending != row.ending) continue;
        if (qobject_cast<QApplication*>(QCoreApplication::instance()) == nullptr)
            return "Pictures cannot be drawn here";
        QByteArray bytes;
        QBuffer buffer(&bytes);
        buffer.open(QIODevice::WriteOnly);
        if (!row.write(buffer, size, paint, row.kind) || bytes.isEmpty())
            return "Cannot draw " + path;
        return writePicture(path, bytes);
    }
    return ending.isEmpty() ? "A picture's name ends in its kind: svg, png or pdf"
                            : "Unknown kind of picture: ." + ending + " (svg, png or pdf)";
}

}  // namespace

QString writePicture(const QString& path, const QByteArray& bytes) {
    const FileProblem problem = SystemFiles().replace(
        path.toStdString(), {bytes.constData(), static_cast<std::size_t>(bytes.size())});
    if (problem.empty()) return {};
    return "Cannot write " + path + ": " + QString::fromStdString(problem);
}

bool savePicture(const QString& path, QSize size, QString* error, const Paint& paint) {
    const QString problem = save(path, size, paint);
    if (error != nullptr) *error = problem;
    return problem.isEmpty();
}

}  // namespace zel
