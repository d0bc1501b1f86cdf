#pragma once
// The language of the window's own texts and of the system's messages.

#include <QString>
#include <span>

namespace zel {

/// The reasons that the system gives (why a file cannot be written) stand among the program's
/// English texts, so they are in English too. To be called after the toolkit has taken over the
/// settings of the user.
void useEnglishMessages();

struct UiLanguage {
    const char* code;  ///< empty: that of the system
    const char* name;  ///< in itself
};
std::span<const UiLanguage> languages();
/// Takes the texts of that language from the folder `translations` of the program's folder; an
/// empty choice is the system's. Returns the code of the language in use: "en" without a file.
QString useLanguage(const QString& choice, const QString& programFolder);

}  // namespace zel
