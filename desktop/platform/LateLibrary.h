#pragma once
// Libraries of the program's own that are loaded when they are first needed.

#include <QString>
#include <string>

namespace zel {

/// The function `symbol` of a library of this version in the folder "parts" of the program's
/// companions. Null when
/// the library cannot be loaded; `problem` then says why, for a user. The library stays loaded to
/// the end.
QFunctionPointer lateFunction(const QString& library, const char* symbol, std::string& problem);

}  // namespace zel
