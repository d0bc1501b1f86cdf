#pragma once
// A script of requests and answers that checks every byte sent and delivers what is to come back.

#include <cstddef>
#include <functional>
#include <initializer_list>
#include <set>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "platform/Events.h"
#include "platform/virtual/LineFaults.h"

namespace zel {

/// Bytes in hex, followed by themselves as a quoted text with `\r`, `\n`, `\xHH` escapes.
std::string hexAndText(std::string_view bytes);

/// Steps are played in their order. A step's answers go out when its last byte was sent. A
/// dialogue without steps takes and records everything.
class Dialogue {
  public:
    explicit Dialogue(Events& events) : events_(events) {}
    ~Dialogue();
    Dialogue(const Dialogue&) = delete;
    Dialogue& operator=(const Dialogue&) = delete;

    /// Begins a step: the program sends these bytes.
    Dialogue& expect(std::string bytes);
    /// The step's answer; several follow one another.
    Dialogue& answer(std::string bytes);
    /// Bytes that nobody asked for, after what came before; before all steps, at the opening.
    Dialogue& noise(std::string bytes) { return answer(std::move(bytes)); }
    /// The last answer comes so many milliseconds later than it would.
    Dialogue& after(int ms);
    /// The last answer comes in pieces of these lengths and a rest, `gapMs` between them.
    Dialogue& chunks(std::initializer_list<std::size_t> lengths, int gapMs);
    /// The step has no answer.
    Dialogue& silence() { return *this; }
    /// The step `times` times more.
    Dialogue& repeat(int times);
    /// The line dies after the last answer.
    Dialogue& dies();

    /// Faults of the line, by the number of bytes delivered.
    LineFaults faults;

    /// The line is open: what stands before the first step goes out.
    void opened();
    /// The program sent bytes.
    void sent(std::string_view bytes);
    /// What is still under way comes to nobody.
    void closed();

    /// Gets the bytes that arrive.
    std::function<void(const std::string&)> deliver;
    /// The line died.
    std::function<void()> died;

    /// The first difference: the step's number from 1, what was expected and what was sent, in
    /// hex; empty while all is well. After a failure nothing is answered any more.
    const std::string& failure() const { return failure_; }
    /// The steps that were not played; empty when all were.
    std::string leftOver() const;
    /// All bytes that the program sent.
    const std::string& written() const { return written_; }
    long delivered() const { return delivered_; }

  private:
    struct Piece {
        std::string bytes;
        int delayMs = 0;
        bool dies = false;
    };
    struct Step {
        std::string request;
        std::vector<Piece> pieces;
        std::size_t lastAnswer = 0;  ///< index of the last answer's first piece
    };

    Step& lastStep();
    void check(std::string_view bytes);
    void fail(std::string_view got);
    void play(const Step& step);
    void arrive(const Piece& piece);
    void hand(const std::string& bytes);
    void release(const std::string& rest, bool dies);
    void later(double ms, std::function<void()> task);

    Events& events_;
    Step opening_;
    std::vector<Step> steps_;
    std::size_t current_ = 0;
    std::string partly_;  ///< what was sent of the current step's request
    std::string failure_;
    std::string written_;
    long delivered_ = 0;
    std::set<TaskId> underWay_;
    bool held_ = false;  ///< a split is under way: what follows waits after it
    std::vector<Piece> waiting_;
};

}  // namespace zel
