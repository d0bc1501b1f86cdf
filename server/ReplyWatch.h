#pragma once
// Follows the dialogue between client and instrument, to know when a reply is whole.

#include <cstddef>
#include <string>
#include <string_view>

namespace zel {

/// A mode word is answered by a status, a setting or a command by a status, a query by a status and
/// a line of text; each ends with CR. What does not follow this, and a status that refuses, is
/// unclear until the line has been quiet: nothing is said about it.
class ReplyWatch {
  public:
    static constexpr std::size_t kLongestLine = 256;
    static constexpr std::size_t kLongestReply = 4096;

    /// The client's next bytes, split anywhere.
    void asked(std::string_view bytes);
    /// The instrument's next bytes, split anywhere. True when they end the whole reply to what the
    /// client asked, and nothing stands after it.
    bool answered(std::string_view bytes);
    /// The line has been quiet, and what came has gone on.
    void quiet();
    void reset();

  private:
    enum class Mode { None, Change, Query };
    enum class Await { Nothing, ModeStatus, Status, QueryStatus, Text, Unclear };

    void lineAsked();
    void lineAnswered();
    void lose();

    Mode mode_ = Mode::None;
    Await await_ = Await::Nothing;
    std::string line_;   ///< of the client, without its CR
    std::string reply_;  ///< the instrument's line so far
};

}  // namespace zel
