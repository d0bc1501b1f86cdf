#pragma once
// After an attempt that found no instrument: tries each baud rate and connects at the right one.

#include <vector>

#include "connection/ConnectionDialog.h"
#include "connection/Doctor.h"
#include "forms/Forms.h"
#include "forms/MainForm.h"
#include "link/ZELBas.h"
#include "platform/Event.h"
#include "platform/Session.h"

namespace zel {

class RateSearch {
  public:
    /// Connects the dialog's search button, and its cancel buttons, which leave a search.
    RateSearch(Forms& forms, ZELBas& state, Doctor& doctor, ConnectionDialog& dialog,
               const Session& session);

    void SearchRatesButton_Click();

  private:
    /// The dialog's rates and one more, the one that has failed last.
    std::vector<int> rates() const;

    Forms& forms_;
    MainForm& form_;
    ZELBas& state_;
    Doctor& doctor_;
    ConnectionDialog& dialog_;
    Session session_;
    bool left_ = false;
    Handlers handlers_;
};

}  // namespace zel
