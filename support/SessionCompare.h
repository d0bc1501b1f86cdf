#pragma once
// Follows the bytes that a program sends against those of a recorded session.

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

#include "support/SessionText.h"

namespace zel {

class SessionCompare {
  public:
    struct Difference {
        std::size_t byte = 0;   ///< of all that the program has sent, from 0
        std::size_t event = 0;  ///< of the record; its count where nothing more was to be sent
        std::string text;       ///< "byte 12 differs: 52 instead of 47"
    };

    /// The record must outlive this.
    explicit SessionCompare(const SessionRecord& record);

    /// The program sends this. False from the first byte on that differs.
    bool sent(char byte);
    bool sent(std::string_view bytes);
    /// The event whose bytes are to be sent next; the count of events after the last one.
    std::size_t place() const { return place_; }
    bool complete() const { return place_ == record_.events.size(); }
    const std::optional<Difference>& difference() const { return difference_; }

  private:
    void findPlace();

    const SessionRecord& record_;
    std::size_t place_ = 0;
    std::size_t within_ = 0;  ///< bytes of that event that were sent
    std::size_t bytes_ = 0;
    std::optional<Difference> difference_;
};

}  // namespace zel
