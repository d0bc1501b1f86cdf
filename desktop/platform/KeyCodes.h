#pragma once
// The codes under which the program's handlers know the keys of the keyboard.

class QKeyEvent;

namespace zel {

/// 0 for a key that has none.
int keyCodeOf(const QKeyEvent& event);

}  // namespace zel
