#include "desktop/platform/LateLibrary.h"

#include <QLibrary>
#include <string>

#include "desktop/platform/QtServices.h"
#include "support/VersionInfo.h"

namespace zel {

QFunctionPointer lateFunction(const QString& library, const char* symbol, std::string& problem) {
    // A program that runs on while it is replaced does not get the library of its successor.
    const QString path = QString::fromStdString(companionFolder() + "/parts/") + library + "-" +
                         QString::fromStdString(versionText(kVersion)) + ".so";
    QLibrary file(path);
    const QFunctionPointer found = file.resolve(symbol);
    problem = found != nullptr
                  ? std::string()
                  : "A part of the program cannot be loaded (" + file.errorString().toStdString() +
                        "). Start the program again; if that does not help, install it again.";
    return found;
}

}  // namespace zel
