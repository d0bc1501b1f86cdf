#pragma once
// Shows a form and comes back when it is closed.

#include "platform/Events.h"
#include "platform/Form.h"

namespace zel {

/// The front end shows the form above all others; events run meanwhile.
void showModalForm(Form& form, Events& events);

}  // namespace zel
