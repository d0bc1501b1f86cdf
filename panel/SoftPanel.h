#pragma once
// Lays out the soft positions and the hard keys for a menu. Nothing goes over the link.

#include <cstdint>
#include <string_view>

#include "forms/ControllerForm.h"
#include "panel/SoftPositions.h"

namespace zel {

class SoftPanel {
  public:
    explicit SoftPanel(ControllerForm& panel) : panel_(panel) {}

    void SetStates(std::int16_t oldState, std::int16_t newState);
    /// A clean menu: empty boxes, the new state, all soft keys visible, the first one red.
    void InitForm(std::int16_t newState);
    /// The key of the index red, all others the normal face.
    void SetSoftButtonsColor(int index);
    /// "gray", "red" or "green"; any other word does nothing.
    void SetButtonColor(int index, std::string_view word);
    void ShowAllSoftKeys();
    void HideChoiceBoxes();
    void UnlockChoiceBoxes();
    void UnlockTextFields();
    void SetSoftBoxesToEditable();
    void SetButtonsActive();
    void SetTextFieldsAndFrames(std::int16_t state);
    /// The pictures of the hard keys: the key of the state in its blue form.
    void SetButtonsStatus(std::int16_t state);
    /// The sub-menus of the measurement menu.
    void layTransducerMenu();
    void layLimitMenu();
    /// Writes the captions of a menu and hides the keys without one.
    void setKeyCaptions(std::int16_t state);

  private:
    void laySubMenu(std::int16_t state);
    void layPosition(const SoftPosition& position);

    ControllerForm& panel_;
};

}  // namespace zel
