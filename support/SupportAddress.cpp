#include "support/SupportAddress.h"

#include <cstddef>
#include <string>

namespace zel {

// The build defines the address for this file.
const std::string kSupportAddress{ZEL_SUPPORT_ADDRESS};

std::string captionText(const std::string& caption) {
    std::string text;
    for (std::size_t i = 0; i < caption.size(); ++i) {
        if (caption[i] == '&' && i + 1 < caption.size()) ++i;
        text += caption[i];
    }
    return text;
}

}  // namespace zel
