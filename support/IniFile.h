#pragma once
// The text form of sections and keys, read and changed with every other line left as it stands.

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "platform/Files.h"

namespace zel {

/// Sections and keys compare without case; of two of the same name the first counts. Blanks around
/// names and values and one pair of quotes around a value are no part of them. A file of more than
/// 1 MiB is neither read nor written.
class IniFile {
  public:
    /// A file that is not there is empty. One that cannot be read is empty too, and `save` refuses
    /// to replace what nobody has seen.
    static IniFile load(FileService& files, const std::string& fileName);
    static IniFile parse(std::string_view text);

    std::optional<std::string> value(std::string_view section, std::string_view key) const;
    /// The value as it stands after the first "=", quotes and all, without the blanks around it.
    std::optional<std::string> rawValue(std::string_view section, std::string_view key) const;
    /// Line ends in the value become blanks. False for a name that no line can hold: empty, with
    /// blanks at its ends, with a line end, or a key with "=" or that begins with ";" or "[".
    bool setValue(std::string_view section, std::string_view key, std::string_view value);
    bool removeKey(std::string_view section, std::string_view key);
    bool removeSection(std::string_view section);
    bool hasSection(std::string_view section) const;
    std::vector<std::string> sections() const;
    std::vector<std::string> keys(std::string_view section) const;

    std::string text() const;
    /// Replaces the file in one step. False after a failure; the file is then as it was.
    bool save(FileService& files, const std::string& fileName) const;

  private:
    struct Line {
        std::string text;  ///< as it stands, without its end
        std::string end;   ///< empty where the file stops without one
        std::string key;   ///< empty for a line that is no key
        std::string value;
    };
    struct Section {
        std::string name;
        Line header;  ///< without text for the lines before the first section
        std::vector<Line> lines;
    };
    const Section* find(std::string_view name) const;
    Section* find(std::string_view name);

    std::vector<Section> sections_{Section{}};
    std::string lineEnd_ = "\r\n";  ///< of new lines
    bool byteOrderMark_ = false;
    bool readable_ = true;
};

}  // namespace zel
