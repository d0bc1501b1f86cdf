#include "platform/ModalForm.h"

#include "platform/Events.h"
#include "platform/Form.h"

namespace zel {
namespace {

constexpr int kWaitMs = 200;

}  // namespace

void showModalForm(Form& form, Events& events) {
    form.Modal = true;
    form.Show();
    while (form.Visible) events.wait(kWaitMs);
    form.Modal = false;
}

}  // namespace zel
