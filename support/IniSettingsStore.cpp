#include "support/IniSettingsStore.h"

#include <utility>

#include "support/IniFile.h"

namespace zel {
namespace {

std::string sectionName(const std::string& application, const std::string& section) {
    return application + "/" + section;
}

}  // namespace

IniSettingsStore::IniSettingsStore(std::string fileName) : fileName_(std::move(fileName)) {}

std::string IniSettingsStore::get(const std::string& application, const std::string& section,
                                  const std::string& key, const std::string& fallback) const {
    return IniFile::load(fileName_)
        .value(sectionName(application, section), key)
        .value_or(fallback);
}

bool IniSettingsStore::set(const std::string& application, const std::string& section,
                           const std::string& key, const std::string& value) {
    IniFile file = IniFile::load(fileName_);
    return file.setValue(sectionName(application, section), key, value) && file.save(fileName_);
}

}  // namespace zel
