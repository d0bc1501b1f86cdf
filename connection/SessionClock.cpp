#include "connection/SessionClock.h"

#include <string_view>

#include "support/TimeText.h"

namespace zel {

void SessionClock::InitTimer(std::string_view word) {
    if (word == "stop") {
        panel_.UpNow.Enabled = false;
        return;
    }
    panel_.StartT = clock_.date();
    panel_.UpNow.Enabled = true;
}

void SessionClock::show() {
    if (panel_.LinkLost) return;  // it says so, and when
    panel_.TimeLabel.Caption = timeOfDayText(clock_.date() - panel_.StartT);
}

}  // namespace zel
