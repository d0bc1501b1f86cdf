// For programs that have the sockets inside: tests and benches, which stand elsewhere than the
// program's companions.

#include "desktop/platform/SocketParts.h"

namespace zel {

[[maybe_unused]] static const bool kInside = (haveSocketParts(*zelSocketParts()), true);

}  // namespace zel
