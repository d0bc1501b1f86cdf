#pragma once
// A modem with AT commands between the host and the instrument, with a telephone net beyond it.

#include <cstddef>
#include <deque>
#include <optional>
#include <string>
#include <string_view>

#include "ZELSim/HostLine.h"
#include "ZELSim/Phonebook.h"

namespace zelsim {

/// Understands E, &F, Z, X, Q, V, D, H, O, &W and other &, S and + commands (which it takes and
/// ignores), several in one line. Online it is transparent until "+++" with a second of silence
/// before it and after it. A host that goes hangs up.
class Modem : public HostLine {
  public:
    Modem(HostLine& instrument, Phonebook book);

    void receive(std::string_view bytes) override;
    void advance(double seconds) override;
    std::string take() override;
    std::optional<double> nextDue() const override;
    void reset() override;
    bool congested() const override { return instrument_.congested(); }
    /// A modem follows the rate of its host.
    void setHostBaud(int) override {}

    /// A call stands, whether the host speaks with the instrument or with the modem.
    bool called() const { return called_; }

  private:
    enum class State { Command, Dialling, Online };
    struct Piece {
        double due;
        std::string bytes;
        bool connects = false;
    };

    void command(char c);
    void obey(const std::string& line);
    /// One command of a line from `at` on, which then stands after it. False for an error.
    bool obeyOne(const std::string& line, std::size_t& at);
    void dial(const std::string& number);
    void say(const std::string& word, int code, double after = 0);
    void hangUp();
    void watchEscape(std::string_view bytes);
    void escapeIfDue();

    HostLine& instrument_;
    Phonebook book_;
    State state_ = State::Command;
    bool called_ = false;
    bool echo_ = true;
    bool quiet_ = false;
    bool words_ = true;
    int level_ = 4;
    int speed_ = 19200;
    double now_ = 0;
    double lastByte_ = -10;  ///< when the host last sent, while online
    std::size_t pluses_ = 0;
    std::string line_;
    bool spoken_ = false;  ///< what was said to this command line
    std::deque<Piece> pieces_;
};

}  // namespace zelsim
