#pragma once
// What becomes of a call to a number of the simulated telephone net.

#include <cstddef>
#include <istream>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace zelsim {

enum class CallResult { Connect, Busy, NoCarrier, NoDialtone, NoAnswer, Silence };

struct PhoneEntry {
    std::string number;  ///< "*" stands for any number
    CallResult result = CallResult::Connect;
    int speed = 19200;      ///< bits a second that CONNECT reports
    double after = 1;       ///< s from the dialling to the result word
    std::size_t chunk = 0;  ///< the result comes in pieces of so many characters; 0: whole
    double gap = 0.05;      ///< s between the pieces
    bool operator==(const PhoneEntry&) const = default;
};

/// The first entry that fits a number counts; a number of none connects.
class Phonebook {
  public:
    /// Some numbers of each result, for trying: see `phonebookHelp`.
    static Phonebook standard();
    /// A line an entry: number, result ("CONNECT", "BUSY", "NO CARRIER", "NO DIALTONE",
    /// "NO ANSWER", "SILENCE"), then any of speed=N, after=S, chunk=N, gap=S. "#" begins a comment.
    /// False for a line that is none of that; `problem` then says which and why.
    bool read(std::istream& text, std::string& problem);
    void add(PhoneEntry entry) { entries_.push_back(std::move(entry)); }
    /// Only digits, "+", "*", "#" and letters of a number count.
    PhoneEntry find(std::string_view number) const;

  private:
    std::vector<PhoneEntry> entries_;
};

/// The text of --help on telephony.
std::string_view phonebookHelp();

}  // namespace zelsim
