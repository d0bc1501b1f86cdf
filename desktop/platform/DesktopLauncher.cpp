#include "desktop/platform/DesktopLauncher.h"

#include <QDesktopServices>
#include <QFileInfo>
#include <QUrl>
#include <string>
#include <vector>

namespace zel {

bool DesktopLauncher::start(const std::string& path, const std::vector<std::string>& arguments) {
    const QFileInfo file(QString::fromStdString(path));
    if (file.isFile() && !file.isExecutable())
        return QDesktopServices::openUrl(QUrl::fromLocalFile(file.absoluteFilePath()));
    return QtLauncher::start(path, arguments);
}

}  // namespace zel
