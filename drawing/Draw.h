#pragma once
// One run of the program that draws pictures.

#include <QIODevice>
#include <string>

namespace zel {

/// More than the longest waterfall takes.
inline constexpr qint64 kMostPictureBytes = 256 * 1024 * 1024;

/// Reads the picture's data from `input` and draws it into `file`, the kind by its ending. What
/// went wrong, else an empty text; an older file is then as it was.
std::string drawPicture(QIODevice& input, const std::string& file);

}  // namespace zel
