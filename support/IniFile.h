#pragma once
// The text form of sections and keys, read and changed with every other line left as it stands.

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace zel {

/// Sections and keys compare without case. A file of more than 1 MiB is not read.
class IniFile {
  public:
    /// A file that is not there, or that is no text of this size, is empty.
    static IniFile load(const std::string& fileName);
    static IniFile parse(std::string_view text);

    std::optional<std::string> value(std::string_view section, std::string_view key) const;
    void setValue(std::string_view section, std::string_view key, std::string_view value);
    bool removeKey(std::string_view section, std::string_view key);
    bool removeSection(std::string_view section);
    bool hasSection(std::string_view section) const;
    std::vector<std::string> sections() const;
    std::vector<std::string> keys(std::string_view section) const;

    std::string text() const;
    /// Writes beside the file first, so that a failure leaves the file as it was; false then.
    bool save(const std::string& fileName) const;

  private:
    struct Line {
        std::string text;  ///< as it stands, without its end
        std::string key;   ///< empty for a line that is no key
        std::string value;
    };
    struct Section {
        std::string name;  ///< empty for the lines ahead of the first section
        std::string header;
        std::vector<Line> lines;
    };
    const Section* find(std::string_view name) const;
    Section* find(std::string_view name);

    std::vector<Section> sections_{Section{}};
    std::string lineEnd_ = "\r\n";
};

}  // namespace zel
