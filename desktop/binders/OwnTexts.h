#pragma once
// The program's own sentences in the language of the window.

#include <QString>
#include <string>

#include "platform/Form.h"

namespace zel {

/// A sentence that the program made, such as "ttyUSB0 is back.", in the language of the user; one
/// that is none of the known ones stays as it is.
QString ownText(const QString& sentence);
QString ownText(const std::string& sentence);
/// The text of a label: those that hold sentences of the program's own are translated, those of
/// the instrument's panel stay as they are.
QString labelText(const Control& label, const std::string& caption);

}  // namespace zel
