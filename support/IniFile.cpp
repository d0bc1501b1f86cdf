#include "support/IniFile.h"

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iterator>

#include "support/Text.h"

namespace zel {
namespace {

constexpr std::uintmax_t kLargestFile = 1U << 20;
constexpr std::string_view kByteOrderMark = "\xEF\xBB\xBF";

bool sameName(std::string_view a, std::string_view b) { return upperCase(a) == upperCase(b); }

/// Quotes around a value keep its blanks and are no part of it.
std::string unquoted(std::string value) {
    if (value.size() < 2) return value;
    const char quote = value.front();
    const bool quoted = (quote == '"' || quote == '\'') && value.back() == quote;
    return quoted ? value.substr(1, value.size() - 2) : value;
}

}  // namespace

IniFile IniFile::load(const std::string& fileName) {
    std::error_code error;
    const std::uintmax_t size = std::filesystem::file_size(fileName, error);
    if (error || size > kLargestFile) return {};
    std::ifstream stream(fileName, std::ios::binary);
    const std::string bytes{std::istreambuf_iterator<char>(stream), {}};
    return parse(wireToUtf8(bytes));
}

IniFile IniFile::parse(std::string_view text) {
    IniFile file;
    if (startsWith(text, kByteOrderMark)) text.remove_prefix(kByteOrderMark.size());
    if (!text.empty() && text.find("\r\n") == std::string_view::npos) file.lineEnd_ = "\n";
    while (!text.empty()) {
        const auto end = text.find('\n');
        std::string line(text.substr(0, end));
        text.remove_prefix(end == std::string_view::npos ? text.size() : end + 1);
        if (!line.empty() && line.back() == '\r') line.pop_back();
        const std::string plain = trimmed(line);
        const auto bracket = plain.find(']');
        if (!plain.empty() && plain.front() == '[' && bracket != std::string::npos) {
            file.sections_.push_back({trimmed(plain.substr(1, bracket - 1)), line, {}});
            continue;
        }
        Line entry{line, "", ""};
        const auto equals = plain.find('=');
        const bool comment = plain.empty() || plain.front() == ';' || plain.front() == '#';
        if (!comment && equals != std::string::npos && equals > 0) {
            entry.key = trimmed(plain.substr(0, equals));
            entry.value = unquoted(trimmed(plain.substr(equals + 1)));
        }
        file.sections_.back().lines.push_back(std::move(entry));
    }
    return file;
}

const IniFile::Section* IniFile::find(std::string_view name) const {
    for (const Section& section : sections_)
        if (!section.header.empty() && sameName(section.name, name)) return &section;
    return nullptr;
}

IniFile::Section* IniFile::find(std::string_view name) {
    return const_cast<Section*>(static_cast<const IniFile*>(this)->find(name));
}

std::optional<std::string> IniFile::value(std::string_view section, std::string_view key) const {
    const Section* found = find(section);
    if (found == nullptr) return std::nullopt;
    for (const Line& line : found->lines)
        if (!line.key.empty() && sameName(line.key, key)) return line.value;
    return std::nullopt;
}

void IniFile::setValue(std::string_view section, std::string_view key, std::string_view value) {
    Section* found = find(section);
    if (found == nullptr) {
        sections_.push_back({std::string(section), "[" + std::string(section) + "]", {}});
        found = &sections_.back();
    }
    // A line end in a value would begin a line of its own.
    std::string plain = replaceAll(replaceAll(value, "\r", " "), "\n", " ");
    const bool blanks =
        !plain.empty() && (plain.front() == ' ' || plain.back() == ' ' || unquoted(plain) != plain);
    const std::string written = blanks ? "\"" + plain + "\"" : plain;
    Line entry{std::string(key) + "=" + written, std::string(key), plain};
    for (Line& line : found->lines) {
        if (line.key.empty() || !sameName(line.key, key)) continue;
        line = std::move(entry);
        return;
    }
    // Behind the section's last line that says something.
    auto place = found->lines.end();
    while (place != found->lines.begin() && trimmed(std::prev(place)->text).empty()) --place;
    found->lines.insert(place, std::move(entry));
}

bool IniFile::removeKey(std::string_view section, std::string_view key) {
    Section* found = find(section);
    if (found == nullptr) return false;
    return std::erase_if(found->lines, [&](const Line& line) {
               return !line.key.empty() && sameName(line.key, key);
           }) > 0;
}

bool IniFile::removeSection(std::string_view section) {
    return std::erase_if(sections_, [&](const Section& candidate) {
               return !candidate.header.empty() && sameName(candidate.name, section);
           }) > 0;
}

bool IniFile::hasSection(std::string_view section) const { return find(section) != nullptr; }

std::vector<std::string> IniFile::sections() const {
    std::vector<std::string> names;
    for (const Section& section : sections_)
        if (!section.header.empty()) names.push_back(section.name);
    return names;
}

std::vector<std::string> IniFile::keys(std::string_view section) const {
    std::vector<std::string> names;
    if (const Section* found = find(section))
        for (const Line& line : found->lines)
            if (!line.key.empty()) names.push_back(line.key);
    return names;
}

std::string IniFile::text() const {
    std::string text;
    for (const Section& section : sections_) {
        if (!section.header.empty()) text += section.header + lineEnd_;
        for (const Line& line : section.lines) text += line.text + lineEnd_;
    }
    return text;
}

bool IniFile::save(const std::string& fileName) const {
    const std::string beside = fileName + ".new";
    {
        std::ofstream stream(beside, std::ios::binary | std::ios::trunc);
        stream << text();
        stream.close();
        if (!stream) {
            std::error_code ignored;
            std::filesystem::remove(beside, ignored);
            return false;
        }
    }
    std::error_code error;
    std::filesystem::rename(beside, fileName, error);
    return !error;
}

}  // namespace zel
