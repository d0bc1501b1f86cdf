#pragma once
// What stands for the machine's registry: keys with named values, kept in an ini file.

#include <cstdint>
#include <functional>
#include <stdexcept>
#include <string>
#include <vector>

#include "platform/Files.h"

namespace zel {

/// A failed operation; `source` is the program's name and ".cRegistry".
struct RegistryError : std::runtime_error {
    explicit RegistryError(const std::string& description)
        : std::runtime_error(description), source("ZELRemote.cRegistry") {}
    std::string source;
};

// Root keys.
inline constexpr std::int32_t HKEY_CLASSES_ROOT = static_cast<std::int32_t>(0x80000000);
inline constexpr std::int32_t HKEY_CURRENT_USER = static_cast<std::int32_t>(0x80000001);
inline constexpr std::int32_t HKEY_LOCAL_MACHINE = static_cast<std::int32_t>(0x80000002);
// Value types.
inline constexpr std::int32_t REG_SZ = 1;
inline constexpr std::int32_t REG_EXPAND_SZ = 2;
inline constexpr std::int32_t REG_DWORD = 4;

/// A further program that opens files of a class: its verb, the menu's text and the command.
struct EXEAssociation {
    std::string verb;
    std::string menuText;
    std::string command;
};

class cRegistry {
  public:
    using Environment = std::function<std::string(const std::string&)>;

    /// `fileName` holds the keys; `environment` gives the value of a variable by its name.
    cRegistry(FileService& files, std::string fileName, Environment environment);

    std::int32_t ClassKey = HKEY_CURRENT_USER;
    std::string SectionKey;
    std::string ValueKey;
    std::int32_t ValueType = REG_SZ;
    std::string Default;  ///< what `Value` gives when none is stored

    bool KeyExists() const;
    /// Each throws RegistryError when it fails.
    void CreateKey();
    void DeleteKey();
    void DeleteValue();
    /// Also sets `ValueType`. In an expandable text each name between two "%" is replaced by its
    /// value in the environment.
    std::string Value();
    void setValue(const std::string& value);
    bool EnumerateValues(std::vector<std::string>& names, std::int32_t& count) const;
    /// The keys directly below `SectionKey`.
    bool EnumerateSections(std::vector<std::string>& names, std::int32_t& count) const;

    /// Below "SOFTWARE\Classes\": the file ending points at the class, the class at the program.
    void CreateEXEAssociation(const std::string& exePath, const std::string& className,
                              const std::string& classDescription, const std::string& association,
                              const std::string& openMenuText = "&Open", bool supportPrint = false,
                              const std::string& printMenuText = "&Print", bool supportNew = false,
                              const std::string& newMenuText = "&New", bool supportInstall = false,
                              const std::string& installMenuText = "&Install",
                              int defaultIconIndex = -1);
    void CreateAdditionalEXEAssociations(const std::string& className,
                                         const std::vector<EXEAssociation>& items);

  private:
    std::string keyName() const;
    std::string expanded(const std::string& text) const;
    void writeAt(const std::string& section, const std::string& valueName,
                 const std::string& value);

    FileService& files_;
    std::string fileName_;
    Environment environment_;
};

}  // namespace zel
