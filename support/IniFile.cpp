#include "support/IniFile.h"

#include <algorithm>
#include <cstddef>
#include <iterator>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "platform/Files.h"
#include "support/FileText.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr std::size_t kLargestFile = 1U << 20;
constexpr std::string_view kByteOrderMark = "\xEF\xBB\xBF";
constexpr std::string_view kBlanks = " \t";

bool sameName(std::string_view a, std::string_view b) { return upperCase(a) == upperCase(b); }

std::string_view withoutBlanks(std::string_view text) {
    const auto first = text.find_first_not_of(kBlanks);
    if (first == std::string_view::npos) return {};
    return text.substr(first, text.find_last_not_of(kBlanks) - first + 1);
}

/// Quotes around a value keep its blanks and are no part of it.
std::string_view unquoted(std::string_view value) {
    if (value.size() < 2) return value;
    const char quote = value.front();
    const bool quoted = (quote == '"' || quote == '\'') && value.back() == quote;
    return quoted ? value.substr(1, value.size() - 2) : value;
}

bool fitsALine(std::string_view name) {
    return !name.empty() && withoutBlanks(name) == name && isValidUtf8(name) &&
           name.find_first_of("\r\n") == std::string_view::npos;
}

bool fitsAKey(std::string_view name) {
    return fitsALine(name) && name.find('=') == std::string_view::npos && name.front() != ';' &&
           name.front() != '[';
}

/// The section's name between the brackets, where the line is a header.
std::optional<std::string> headerName(std::string_view plain) {
    if (!startsWith(plain, "[")) return std::nullopt;
    const auto bracket = plain.back() == ']' ? plain.size() - 1 : plain.find(']');
    if (bracket == std::string_view::npos) return std::nullopt;
    return std::string(withoutBlanks(plain.substr(1, bracket - 1)));
}

}  // namespace

IniFile IniFile::load(FileService& files, const std::string& fileName) {
    if (!files.stat(fileName).exists()) return {};
    FileProblem problem;
    if (const auto bytes = readFile(files, fileName, kLargestFile, problem))
        return parse(bytesToUtf8(*bytes));
    IniFile unknown;
    unknown.readable_ = false;
    return unknown;
}

IniFile IniFile::parse(std::string_view text) {
    IniFile file;
    file.byteOrderMark_ = startsWith(text, kByteOrderMark);
    if (file.byteOrderMark_) text.remove_prefix(kByteOrderMark.size());
    if (!text.empty() && text.find("\r\n") == std::string_view::npos) file.lineEnd_ = "\n";
    while (!text.empty()) {
        const auto end = std::min(text.find('\n'), text.size());
        const std::size_t next = std::min(end + 1, text.size());
        const std::size_t stop = end > 0 && text[end - 1] == '\r' ? end - 1 : end;
        Line line{std::string(text.substr(0, stop)), std::string(text.substr(stop, next - stop)),
                  "", ""};
        text.remove_prefix(next);
        const std::string_view plain = withoutBlanks(line.text);
        if (std::optional<std::string> name = headerName(plain)) {
            file.sections_.push_back({std::move(*name), std::move(line), {}});
            continue;
        }
        const auto equals = plain.find('=');
        if (!startsWith(plain, ";") && equals != std::string_view::npos) {
            std::string key(withoutBlanks(plain.substr(0, equals)));
            std::string value(unquoted(withoutBlanks(plain.substr(equals + 1))));
            line.key = std::move(key);
            line.value = std::move(value);
        }
        file.sections_.back().lines.push_back(std::move(line));
    }
    return file;
}

const IniFile::Section* IniFile::find(std::string_view name) const {
    for (const Section& section : sections_)
        if (!section.header.text.empty() && sameName(section.name, name)) return &section;
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

std::optional<std::string> IniFile::rawValue(std::string_view section, std::string_view key) const {
    const Section* found = find(section);
    if (found == nullptr) return std::nullopt;
    for (const Line& line : found->lines)
        if (!line.key.empty() && sameName(line.key, key))
            return std::string(
                withoutBlanks(std::string_view(line.text).substr(line.text.find('=') + 1)));
    return std::nullopt;
}

bool IniFile::setValue(std::string_view section, std::string_view key, std::string_view value) {
    if (!fitsALine(section) || !fitsAKey(key)) return false;
    // A line end in a value would begin a line of its own, and a byte that is no UTF-8 would
    // change how the whole file is read.
    std::string plain = replaceAll(replaceAll(bytesToUtf8(value), "\r", " "), "\n", " ");
    const bool needsQuotes = unquoted(withoutBlanks(plain)) != plain;
    const std::string written = needsQuotes ? "\"" + plain + "\"" : plain;
    Section* found = find(section);
    if (found == nullptr) {
        const std::string name(section);
        sections_.push_back({name, {"[" + name + "]", lineEnd_, "", ""}, {}});
        found = &sections_.back();
    }
    const std::string name(key);
    Line entry{name + "=" + written, lineEnd_, name, std::move(plain)};
    for (Line& line : found->lines) {
        if (line.key.empty() || !sameName(line.key, key)) continue;
        entry.end = line.end;
        line = std::move(entry);
        return true;
    }
    // After the section's last line that says something.
    auto place = found->lines.end();
    while (place != found->lines.begin() && withoutBlanks(std::prev(place)->text).empty()) --place;
    found->lines.insert(place, std::move(entry));
    return true;
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
               return !candidate.header.text.empty() && sameName(candidate.name, section);
           }) > 0;
}

bool IniFile::hasSection(std::string_view section) const { return find(section) != nullptr; }

std::vector<std::string> IniFile::sections() const {
    std::vector<std::string> names;
    for (const Section& section : sections_)
        if (!section.header.text.empty()) names.push_back(section.name);
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
    bool ended = true;
    const auto append = [&](const Line& line) {
        if (!ended) text += lineEnd_;  // what was the last line is so no more
        text += line.text + line.end;
        ended = !line.end.empty();
    };
    for (const Section& section : sections_) {
        if (!section.header.text.empty()) append(section.header);
        for (const Line& line : section.lines) append(line);
    }
    return byteOrderMark_ ? std::string(kByteOrderMark) + text : text;
}

bool IniFile::save(FileService& files, const std::string& fileName) const {
    const std::string bytes = text();
    return readable_ && bytes.size() <= kLargestFile && files.replace(fileName, bytes).empty();
}

}  // namespace zel
