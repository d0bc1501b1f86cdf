#pragma once
// The language of the system's own messages.

#include <clocale>

namespace zel {

/// The program speaks English, so the reasons that the system gives (why a file cannot be written)
/// are in English too. To be called after the toolkit has taken over the settings of the user.
inline void useEnglishMessages() { std::setlocale(LC_MESSAGES, "C"); }

}  // namespace zel
