#include "connection/RateSearch.h"

#include <algorithm>
#include <optional>
#include <string>
#include <vector>

#include "connection/ConnectionDialog.h"
#include "connection/Doctor.h"
#include "forms/Forms.h"
#include "link/ByteLink.h"
#include "link/ZELBas.h"
#include "platform/LinkAddress.h"
#include "platform/Pointer.h"
#include "platform/Session.h"
#include "support/AtEnd.h"
#include "support/NumberText.h"

namespace zel {
namespace {

constexpr int kSlowest = 9600;  // offered by no list, and what some instruments are delivered with

}  // namespace

RateSearch::RateSearch(Forms& forms, ZELBas& state, Doctor& doctor, ConnectionDialog& dialog,
                       const Session& session)
    : forms_(forms),
      form_(forms.main),
      state_(state),
      doctor_(doctor),
      dialog_(dialog),
      session_(session) {
    handlers_.on(form_.SearchRatesButton.Clicked, [this] { SearchRatesButton_Click(); });
    for (Button* cancel : {&form_.CancelConnButton, &form_.CancelConnButton1}) {
        handlers_.on(cancel->Clicked, [this] {
            if (!form_.Searching) return;
            left_ = true;
            doctor_.stop();
        });
    }
}

std::vector<int> RateSearch::rates() const {
    std::vector<int> all;
    for (const std::string& text : form_.BaudList.items())
        if (const auto rate = wholeNumber(text, 1, kFastestBaud)) all.push_back(*rate);
    // The usual ones are the fast ones.
    std::sort(all.rbegin(), all.rend());
    all.push_back(kSlowest);
    const auto failed = wholeNumber(form_.BaudList.Text(), 1, kFastestBaud);
    all.erase(std::remove(all.begin(), all.end(), failed.value_or(0)), all.end());
    if (failed) all.push_back(*failed);
    return all;
}

void RateSearch::SearchRatesButton_Click() {
    if (forms_.controller.isConnected || form_.Searching || form_.Attempting) return;
    const std::string port = form_.COMList.Text();
    const std::string device = serialDeviceName(port, form_.CommPorts);
    const std::vector<int> all = rates();
    std::string tried;
    std::optional<int> found;
    left_ = false;
    {
        const DialogueScope scope(state_);
        form_.Searching = true;
        form_.SearchRatesButton.Visible = false;
        for (Button* close : {&form_.CancelConnButton, &form_.CancelConnButton1})
            close->Caption = "Cancel";
        form_.MousePointer = kHourglass;
        const AtEnd over([this] {
            form_.Searching = false;
            form_.MousePointer = kArrow;
            for (Button* close : {&form_.CancelConnButton, &form_.CancelConnButton1})
                close->Caption = "Close";
        });
        int count = 0;
        found = doctor_.findRate(device, all, [&](int rate) {
            const std::string baud = std::to_string(rate);
            tried += (tried.empty() ? "" : ", ") + baud;
            form_.AdviceLabel.Caption = "Searching the instrument at " + baud + " baud, rate " +
                                        std::to_string(++count) + " of " +
                                        std::to_string(all.size());
            session_.events.pump();
        });
    }
    if (state_.Ending) return;
    if (found) {
        form_.BaudList.setText(std::to_string(*found));
        return dialog_.ZELButton_Click();
    }
    form_.SearchRatesButton.Visible = true;
    form_.AdviceLabel.Caption =
        left_ ? std::string()
              : "No instrument answers on " + port + " at " + tried +
                    " baud. Check that it is on and that its cable is at this port";
}

}  // namespace zel
