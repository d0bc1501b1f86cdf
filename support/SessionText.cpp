#include "support/SessionText.h"

#include <charconv>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <system_error>
#include <vector>

#include "platform/ByteText.h"
#include "support/Text.h"

namespace zel {
namespace {

using Kind = SessionEvent::Kind;

constexpr std::int64_t kMicros = 1'000'000;
constexpr int kDecimals = 6;
constexpr std::size_t kMostDigits = 12;

struct Word {
    Kind kind;
    std::string_view word;
    bool bytes;
};
constexpr Word kWords[] = {
    {Kind::Start, "start", false},   {Kind::Open, "open", false},   {Kind::Sent, ">", true},
    {Kind::Came, "<", true},         {Kind::Input, "input", false}, {Kind::Click, "click", false},
    {Kind::Closed, "closed", false},
};

std::string secondsText(std::int64_t micros) {
    const std::string fraction = std::to_string(kMicros + micros % kMicros).substr(1);
    return std::to_string(micros / kMicros) + "." + fraction;
}

std::string bytesText(std::string_view bytes) {
    std::string hex;
    std::string signs;
    for (const char byte : bytes) {
        hex += hexOf(byte) + " ";
        signs += byte >= ' ' && byte <= '~' ? byte : '.';
    }
    return hex + "|" + signs + "|";
}

/// A text of one line: what would end it is shown as "\r", "\n", and "\" as "\\".
std::string escaped(std::string_view text) {
    return replaceAll(replaceAll(replaceAll(text, "\\", "\\\\"), "\r", "\\r"), "\n", "\\n");
}

std::string unescaped(std::string_view text) {
    std::string plain;
    for (std::size_t i = 0; i < text.size(); ++i) {
        if (text[i] != '\\' || i + 1 == text.size()) {
            plain += text[i];
            continue;
        }
        const char next = text[++i];
        plain += next == 'r' ? '\r' : next == 'n' ? '\n' : next;
    }
    return plain;
}

std::optional<std::int64_t> number(std::string_view digits) {
    std::int64_t value = 0;
    if (digits.empty() || digits.size() > kMostDigits) return std::nullopt;
    const auto [end, problem] =
        std::from_chars(digits.data(), digits.data() + digits.size(), value);
    if (problem != std::errc() || end != digits.data() + digits.size() || value < 0)
        return std::nullopt;
    return value;
}

std::optional<std::int64_t> microsOf(std::string_view time) {
    const auto point = time.find('.');
    if (point == std::string_view::npos || time.size() - point - 1 != kDecimals)
        return std::nullopt;
    const auto seconds = number(time.substr(0, point));
    const auto fraction = number(time.substr(point + 1));
    if (!seconds || !fraction) return std::nullopt;
    return *seconds * kMicros + *fraction;
}

int digitOf(char c) {
    if (c >= '0' && c <= '9') return c - '0';
    if (c >= 'A' && c <= 'F') return c - 'A' + 10;
    if (c >= 'a' && c <= 'f') return c - 'a' + 10;
    return -1;
}

/// The bytes of "47 45 |GE|", which must be there whole.
std::optional<std::string> bytesOf(std::string_view text) {
    const auto bar = text.find('|');
    if (bar == std::string_view::npos) return std::nullopt;
    std::string bytes;
    int half = -1;
    for (const char c : text.substr(0, bar)) {
        if (c == ' ' && half < 0) continue;
        const int digit = digitOf(c);
        if (digit < 0) return std::nullopt;
        if (half < 0) {
            half = digit;
        } else {
            bytes += static_cast<char>(half * 16 + digit);
            half = -1;
        }
    }
    const std::string_view signs = text.substr(bar);
    if (half >= 0 || bytes.empty() || signs.size() != bytes.size() + 2 || signs.back() != '|')
        return std::nullopt;
    return bytes;
}

std::optional<SessionEvent> eventOf(std::string_view line) {
    const auto gap = line.find(' ');
    const auto micros = microsOf(line.substr(0, gap));
    if (!micros || gap == std::string_view::npos) return std::nullopt;
    const std::string_view rest = line.substr(gap + 1);
    const auto end = rest.find(' ');
    const std::string_view word = rest.substr(0, end);
    const std::string_view text =
        end == std::string_view::npos ? std::string_view() : rest.substr(end + 1);
    for (const Word& row : kWords) {
        if (row.word != word) continue;
        if (!row.bytes) return SessionEvent{*micros, row.kind, unescaped(text)};
        const auto bytes = bytesOf(text);
        if (!bytes) return std::nullopt;
        return SessionEvent{*micros, row.kind, *bytes};
    }
    return std::nullopt;
}

}  // namespace

std::string sessionLine(const SessionEvent& event) {
    std::string line = secondsText(event.micros) + " ";
    for (const Word& row : kWords) {
        if (row.kind != event.kind) continue;
        line += row.word;
        if (row.bytes) return line + " " + bytesText(event.text);
    }
    return event.text.empty() ? line : line + " " + escaped(event.text);
}

SessionRecord parseSession(std::string_view text) {
    SessionRecord record;
    int number = 0;
    while (!text.empty()) {
        const auto end = text.find('\n');
        std::string_view line = text.substr(0, end);
        text.remove_prefix(end == std::string_view::npos ? text.size() : end + 1);
        ++number;
        if (!line.empty() && line.back() == '\r') line.remove_suffix(1);
        if (line.empty()) continue;
        const auto event = eventOf(line);
        const bool back =
            event && !record.events.empty() && event->micros < record.events.back().micros;
        if (!event || back) {
            record.problem = "line " + std::to_string(number) + " is damaged";
            return record;
        }
        record.events.push_back(*event);
        record.lines.emplace_back(line);
        record.numbers.push_back(number);
    }
    if (record.events.empty()) {
        record.problem = "it is empty";
    } else if (record.events.front().kind != Kind::Start) {
        record.problem = "it does not begin with \"start\"";
    } else if (record.events.back().kind != Kind::Closed) {
        record.problem = "it was cut: its last line is not \"closed\"";
    }
    return record;
}

std::string joinArguments(const std::vector<std::string>& arguments) {
    std::string line;
    for (const std::string& argument : arguments) {
        if (!line.empty()) line += ' ';
        const bool plain =
            !argument.empty() && argument.find_first_of(" \t\"") == std::string::npos;
        line += plain ? argument : "\"" + replaceAll(argument, "\"", "\"\"") + "\"";
    }
    return line;
}

std::vector<std::string> splitArgumentLine(std::string_view line) {
    std::vector<std::string> arguments;
    bool inside = false;
    bool begun = false;
    for (std::size_t i = 0; i < line.size(); ++i) {
        const char c = line[i];
        if (!inside && (c == ' ' || c == '\t')) {
            begun = false;
            continue;
        }
        if (!begun) arguments.emplace_back();
        begun = true;
        if (c != '"') {
            arguments.back() += c;
        } else if (inside && i + 1 < line.size() && line[i + 1] == '"') {
            arguments.back() += '"';
            ++i;
        } else {
            inside = !inside;
        }
    }
    return arguments;
}

}  // namespace zel
