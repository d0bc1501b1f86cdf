#include "desktop/platform/LateLibrary.h"

#include <QLibrary>
#include <string>

#include "desktop/platform/QtServices.h"

namespace zel {

QFunctionPointer lateFunction(const QString& library, const char* symbol, std::string& problem) {
    const QString path = QString::fromStdString(companionFolder()) + "/parts/" + library + ".so";
    QLibrary file(path);
    const QFunctionPointer found = file.resolve(symbol);
    problem = found != nullptr
                  ? std::string()
                  : "A part of the program cannot be loaded (" + file.errorString().toStdString() +
                        "). Install the program again.";
    return found;
}

}  // namespace zel
