#include "support/cRegistry.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <string>
#include <utility>
#include <vector>

#include "platform/Files.h"
#include "support/IniFile.h"
#include "support/NumberText.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr const char* kClasses = "SOFTWARE\\Classes\\";
constexpr const char* kDefaultValue = "@";  // the value without a name

struct RootName {
    std::int32_t key;
    const char* name;
};
constexpr RootName kRoots[] = {{HKEY_CLASSES_ROOT, "HKEY_CLASSES_ROOT"},
                               {HKEY_CURRENT_USER, "HKEY_CURRENT_USER"},
                               {HKEY_LOCAL_MACHINE, "HKEY_LOCAL_MACHINE"}};

struct TypeMark {
    std::int32_t type;
    const char* mark;
};
// A plain text bears its mark only where it would else be taken for another type.
constexpr TypeMark kTypeMarks[] = {
    {REG_EXPAND_SZ, "expand:"}, {REG_DWORD, "dword:"}, {REG_SZ, "text:"}};

std::string keyText(std::int32_t key) { return generalNumber(key); }

bool beginsWithAMark(const std::string& text) {
    for (const TypeMark& row : kTypeMarks)
        if (startsWith(text, row.mark)) return true;
    return false;
}

std::string valueName(const std::string& name) { return name.empty() ? kDefaultValue : name; }

}  // namespace

cRegistry::cRegistry(FileService& files, std::string fileName, Environment environment)
    : files_(files), fileName_(std::move(fileName)), environment_(std::move(environment)) {}

std::string cRegistry::keyName() const {
    for (const RootName& root : kRoots)
        if (root.key == ClassKey)
            return SectionKey.empty() ? root.name : std::string(root.name) + "\\" + SectionKey;
    return "";
}

bool cRegistry::KeyExists() const {
    const std::string name = upperCase(keyName());
    // A key is there as well when one below it is.
    for (const std::string& section : IniFile::load(files_, fileName_).sections())
        if (upperCase(section) == name || startsWith(upperCase(section), name + "\\")) return true;
    return false;
}

void cRegistry::CreateKey() {
    const std::string name = keyName();
    IniFile file = IniFile::load(files_, fileName_);
    if (file.hasSection(name)) return;
    // A key without values is kept by the value without a name.
    if (!file.setValue(name, kDefaultValue, "") || !file.save(files_, fileName_))
        throw RegistryError("Failed to create registry Key: '" + SectionKey + "'");
}

void cRegistry::DeleteKey() {
    IniFile file = IniFile::load(files_, fileName_);
    if (!file.removeSection(keyName()) || !file.save(files_, fileName_))
        throw RegistryError("Failed to delete registry Key: '" + keyText(ClassKey) +
                            "',Section: '" + SectionKey + "'");
}

void cRegistry::DeleteValue() {
    IniFile file = IniFile::load(files_, fileName_);
    if (!file.hasSection(keyName()))
        throw RegistryError("Failed to open key '" + keyText(ClassKey) + "',Section: '" +
                            SectionKey + "' for delete access");
    if (!file.removeKey(keyName(), valueName(ValueKey)) || !file.save(files_, fileName_))
        throw RegistryError("Failed to delete registry Key: '" + keyText(ClassKey) +
                            "',Section: '" + SectionKey + "',Key: '" + ValueKey + "'");
}

std::string cRegistry::Value() {
    const auto stored = IniFile::load(files_, fileName_).value(keyName(), valueName(ValueKey));
    ValueType = REG_SZ;
    if (!stored) return Default;
    for (const TypeMark& row : kTypeMarks) {
        if (!startsWith(*stored, row.mark)) continue;
        ValueType = row.type;
        const std::string text = stored->substr(std::string_view(row.mark).size());
        return ValueType == REG_EXPAND_SZ ? expanded(text) : text;
    }
    return *stored;
}

void cRegistry::setValue(const std::string& value) {
    std::string written = value;
    const bool marked = ValueType != REG_SZ || beginsWithAMark(value);
    for (const TypeMark& row : kTypeMarks)
        if (marked && row.type == ValueType) written = row.mark + value;
    IniFile file = IniFile::load(files_, fileName_);
    if (!file.setValue(keyName(), valueName(ValueKey), written) || !file.save(files_, fileName_)) {
        throw RegistryError("Failed to set registry value Key: '" + keyText(ClassKey) +
                            "',Section: '" + SectionKey + "',Key: '" + ValueKey + "' to value: '" +
                            value + "'");
    }
}

std::string cRegistry::expanded(const std::string& text) const {
    std::string result;
    std::size_t at = 0;
    for (;;) {
        const auto first = text.find('%', at);
        const auto second = first == std::string::npos ? first : text.find('%', first + 1);
        if (second == std::string::npos) return result + text.substr(at);
        result += text.substr(at, first - at);
        result += environment_(text.substr(first + 1, second - first - 1));
        at = second + 1;
    }
}

bool cRegistry::EnumerateValues(std::vector<std::string>& names, std::int32_t& count) const {
    names = IniFile::load(files_, fileName_).keys(keyName());
    std::erase(names, kDefaultValue);
    count = static_cast<std::int32_t>(names.size());
    return KeyExists();
}

bool cRegistry::EnumerateSections(std::vector<std::string>& names, std::int32_t& count) const {
    names.clear();
    const std::string head = upperCase(keyName()) + "\\";
    for (const std::string& section : IniFile::load(files_, fileName_).sections()) {
        if (!startsWith(upperCase(section), head)) continue;
        const std::string rest = section.substr(head.size());
        const std::string child = rest.substr(0, rest.find('\\'));
        const bool known = std::any_of(names.begin(), names.end(), [&](const std::string& name) {
            return upperCase(name) == upperCase(child);
        });
        if (!known) names.push_back(child);
    }
    count = static_cast<std::int32_t>(names.size());
    return KeyExists();
}

void cRegistry::writeAt(const std::string& section, const std::string& name,
                        const std::string& value) {
    SectionKey = kClasses + section;
    ValueKey = name;
    ValueType = REG_SZ;
    setValue(value);
}

void cRegistry::CreateEXEAssociation(const std::string& exePath, const std::string& className,
                                     const std::string& classDescription,
                                     const std::string& association,
                                     const std::string& openMenuText, bool supportPrint,
                                     const std::string& printMenuText, bool supportNew,
                                     const std::string& newMenuText, bool supportInstall,
                                     const std::string& installMenuText, int defaultIconIndex) {
    const std::string program = "\"" + exePath + "\"";
    writeAt(startsWith(association, ".") ? association : "." + association, "", className);
    writeAt(className, "", classDescription);
    std::vector<EXEAssociation> verbs{{"open", openMenuText, program + " \"%1\""}};
    if (supportPrint) verbs.push_back({"print", printMenuText, program + " /p \"%1\""});
    if (supportNew) verbs.push_back({"new", newMenuText, program + " /n \"%1\""});
    if (supportInstall) verbs.push_back({"install", installMenuText, program + " /i \"%1\""});
    CreateAdditionalEXEAssociations(className, verbs);
    if (defaultIconIndex >= 0)
        writeAt(className + "\\DefaultIcon", "", exePath + "," + std::to_string(defaultIconIndex));
}

void cRegistry::CreateAdditionalEXEAssociations(const std::string& className,
                                                const std::vector<EXEAssociation>& items) {
    for (const EXEAssociation& item : items) {
        writeAt(className + "\\shell\\" + item.verb, "", item.menuText);
        writeAt(className + "\\shell\\" + item.verb + "\\command", "", item.command);
    }
}

}  // namespace zel
