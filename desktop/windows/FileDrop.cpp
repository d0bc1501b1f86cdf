#include "desktop/windows/FileDrop.h"

#include <QDropEvent>
#include <QFileInfo>
#include <QUrl>
#include <functional>
#include <optional>
#include <utility>

namespace zel {

std::optional<QString> draggedFile(const QMimeData& data) {
    const QList<QUrl> urls = data.urls();
    if (urls.size() != 1 || !urls.front().isLocalFile()) return std::nullopt;
    const QString path = urls.front().toLocalFile();
    if (!QFileInfo(path).isFile()) return std::nullopt;
    return path;
}

FileDrop::FileDrop(QWidget& window, std::function<bool()> refuses,
                   std::function<void(const QString&)> open)
    : QObject(&window), refuses_(std::move(refuses)), open_(std::move(open)) {
    window.setAcceptDrops(true);
    later_.setSingleShot(true);
    connect(&later_, &QTimer::timeout, this, [this] {
        if (!refuses_()) open_(path_);
    });
}

bool FileDrop::eventFilter(QObject* watched, QEvent* event) {
    const bool enters = event->type() == QEvent::DragEnter || event->type() == QEvent::DragMove;
    if (!enters && event->type() != QEvent::Drop) return QObject::eventFilter(watched, event);
    auto& drop = *static_cast<QDropEvent*>(event);
    const std::optional<QString> path = draggedFile(*drop.mimeData());
    if (!path || refuses_()) {
        event->ignore();
        return true;
    }
    drop.setDropAction(Qt::CopyAction);
    drop.accept();
    // The source of the drag waits for the end of this event; a series may play for long.
    if (!enters) {
        path_ = *path;
        later_.start(0);
    }
    return true;
}

}  // namespace zel
