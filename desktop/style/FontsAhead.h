#pragma once
// The fonts of the desk are found while the window is built: reading their settings is a third of
// what the window takes, and needs nothing of it.

#include <thread>

namespace zel {

/// Needs the application object, and must go before it. The toolkit's own lock keeps the first
/// text of the window waiting where it comes too early.
class FontsAhead {
  public:
    FontsAhead();
    ~FontsAhead() { wait(); }
    FontsAhead(const FontsAhead&) = delete;
    FontsAhead& operator=(const FontsAhead&) = delete;
    void wait();

  private:
    std::thread work_;
};

}  // namespace zel
