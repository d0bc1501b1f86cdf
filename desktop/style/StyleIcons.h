#pragma once
// Pictures that the style draws itself.

#include <QIcon>

namespace zel {

/// The key of a bar that has no room for all of its entries: two chevrons, in the ink of the keys.
/// The toolkit reads its own from a file, for which it loads its readers of all kinds of pictures.
QIcon moreEntriesIcon(Qt::Orientation orientation);

}  // namespace zel
