#pragma once
// Where bytes come from that end a wait of the event loop.

#include <functional>

namespace zel {

class ArrivalSources {
  public:
    virtual ~ArrivalSources() = default;

    /// A port or socket whose bytes end a wait: its file descriptor (-1 while closed), and
    /// whether bytes wait in its buffer already.
    struct Source {
        std::function<int()> descriptor;
        std::function<bool()> bytesWait;
    };
    virtual int addSource(Source source) = 0;
    virtual void removeSource(int id) = 0;
    /// New bytes have come into the buffer of a source: the wait under way, or else the next one,
    /// ends at once. Bytes that nobody takes end no further wait.
    virtual void bytesArrived(int id) = 0;
    /// Somebody has read from a source what a wait ended for.
    virtual void bytesTaken() = 0;
};

}  // namespace zel
