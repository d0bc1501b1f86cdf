#pragma once
// F1 on a control of any form opens the help at the form's topic.

#include <string_view>

#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "platform/Event.h"

namespace zel {

/// Help topics by the name of the form that asks for them; the contents for a form without one.
inline constexpr int kPanelTopic = 2111;
inline constexpr int kContentsTopic = 1110;
int helpTopicOf(std::string_view form);

class HelpKeys {
  public:
    /// Connects each control that gets keys, the forms themselves and the entry of the help menu.
    explicit HelpKeys(Forms& forms);

  private:
    void keyDown(int key, int topic);

    ControllerForm& panel_;
    Handlers handlers_;
};

}  // namespace zel
