#include "support/SessionCompare.h"

#include <cstddef>
#include <string>
#include <string_view>

#include "platform/ByteText.h"
#include "support/SessionText.h"
#include "support/Text.h"

namespace zel {
namespace {

/// The digits of a PIN are not in the record.
bool same(char sent, char recorded) {
    return sent == recorded || (recorded == '*' && isDigit(sent));
}

}  // namespace

SessionCompare::SessionCompare(const SessionRecord& record) : record_(record) { findPlace(); }

void SessionCompare::findPlace() {
    while (place_ < record_.events.size() &&
           record_.events[place_].kind != SessionEvent::Kind::Sent)
        ++place_;
}

bool SessionCompare::sent(char byte) {
    if (difference_) return false;
    const std::size_t number = bytes_++;
    const std::string head = "byte " + std::to_string(number) + " differs: " + hexOf(byte);
    if (complete()) {
        difference_ = Difference{number, place_, head + " instead of nothing"};
        return false;
    }
    const std::string& wanted = record_.events[place_].text;
    if (!same(byte, wanted[within_])) {
        difference_ = Difference{number, place_, head + " instead of " + hexOf(wanted[within_])};
        return false;
    }
    if (++within_ == wanted.size()) {
        within_ = 0;
        ++place_;
        findPlace();
    }
    return true;
}

bool SessionCompare::sent(std::string_view bytes) {
    for (const char byte : bytes)
        if (!sent(byte)) return false;
    return true;
}

}  // namespace zel
