#pragma once
// The session log as text: a line an event, bytes in hexadecimal with their characters beside.

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace zel {

struct SessionEvent {
    enum class Kind {
        Start,   ///< the program's arguments
        Open,    ///< the port, as an address
        Sent,    ///< bytes to the instrument
        Came,    ///< bytes from it
        Input,   ///< a line of a panel session
        Click,   ///< a control that the user clicked
        Closed,  ///< of the port, and at the end of the log
    };
    std::int64_t micros = 0;  ///< since the log began
    Kind kind = Kind::Start;
    std::string text;  ///< bytes of `Sent` and `Came`, else the text of the event
};

/// "0.001234 > 47 45 54 0D |GET.|", without an end of line.
std::string sessionLine(const SessionEvent& event);

struct SessionRecord {
    std::vector<SessionEvent> events;
    std::vector<std::string> lines;  ///< of each event, as it stands in the file
    std::vector<int> numbers;        ///< of each event, its line in the file, from 1
    /// What is wrong with the file, in words; empty where nothing is. The events before it stand.
    std::string problem;
};

/// Reads a log. One that does not end with `closed` was cut, and is said to be.
SessionRecord parseSession(std::string_view text);

/// Logs of more than this are neither written nor read.
inline constexpr std::uint64_t kLongestSession = 64'000'000;

/// Arguments as one line; those with blanks or quotes stand in quotes, a quote inside twice.
std::string joinArguments(const std::vector<std::string>& arguments);
std::vector<std::string> splitArgumentLine(std::string_view line);

}  // namespace zel
