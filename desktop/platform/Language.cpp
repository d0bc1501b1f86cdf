#include "desktop/platform/Language.h"

#include <locale.h>

#include <QCoreApplication>
#include <QFileInfo>
#include <QLibraryInfo>
#include <QLocale>
#include <QTranslator>
#include <clocale>
#include <span>

namespace zel {
namespace {

constexpr UiLanguage kLanguages[] = {
    {"", "Language of the System"}, {"en", "English"}, {"de", "Deutsch"}};

/// "de" of "de-CH", the first language of the user's that there is.
QString languageOfSystem() {
    for (const QString& wanted : QLocale::system().uiLanguages()) {
        const QString code = wanted.left(2);
        for (const UiLanguage& one : kLanguages)
            if (code == one.code) return code;
    }
    return "en";
}

void install(const QString& path) {
    auto* texts = new QTranslator(QCoreApplication::instance());
    if (texts->load(path)) QCoreApplication::installTranslator(texts);
}

}  // namespace

void useEnglishMessages() { std::setlocale(LC_MESSAGES, "C"); }

std::span<const UiLanguage> languages() { return kLanguages; }

QString useLanguage(const QString& choice, const QString& programFolder) {
    const QString code = choice.isEmpty() ? languageOfSystem() : choice;
    const QString file = programFolder + "/translations/zelremote_" + code + ".qm";
    if (code == "en" || !QFileInfo::exists(file)) return "en";
    // The toolkit's own words, such as those of its file dialog, where they are installed.
    install(QLibraryInfo::path(QLibraryInfo::TranslationsPath) + "/qtbase_" + code + ".qm");
    install(file);
    return code;
}

}  // namespace zel
