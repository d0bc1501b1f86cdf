#pragma once
// Files that are dropped on a window.

#include <QMimeData>
#include <QObject>
#include <QTimer>
#include <QWidget>
#include <functional>
#include <optional>

namespace zel {

/// The path of what is dragged when it is one file of this computer.
std::optional<QString> draggedFile(const QMimeData& data);

/// The event filter of a window that takes one local file and hands its path on when the drop is
/// over. While `refuses` says so, nothing is taken.
class FileDrop : public QObject {
  public:
    FileDrop(QWidget& window, std::function<bool()> refuses,
             std::function<void(const QString&)> open);
    bool eventFilter(QObject* watched, QEvent* event) override;

  private:
    std::function<bool()> refuses_;
    std::function<void(const QString&)> open_;
    QString path_;
    QTimer later_;
};

}  // namespace zel
