#pragma once
// Per-user settings by application, section and key, kept in one ini file.

#include <string>

namespace zel {

/// An application's section "Properties" stands as "[ZELRemote/Properties]". The file is read anew
/// at each call, so that two programs may share it.
class IniSettingsStore {
  public:
    explicit IniSettingsStore(std::string fileName);

    /// The stored text, of any length; the fallback where there is none.
    std::string get(const std::string& application, const std::string& section,
                    const std::string& key, const std::string& fallback) const;
    /// False when the file cannot be read or written, or when no line can hold the names; it is
    /// then as it was.
    bool set(const std::string& application, const std::string& section, const std::string& key,
             const std::string& value);

  private:
    std::string fileName_;
};

}  // namespace zel
