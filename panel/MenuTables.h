#pragma once
// The soft menus as tables: what each position of each menu shows.

#include <array>
#include <cstdint>
#include <optional>
#include <string_view>

#include "model/CodeTables.h"

namespace zel {

enum class PositionKind {
    Box,        ///< an entry box
    LockedBox,  ///< shows, takes no entry
    Choice,     ///< a drop-down list in the box's place
    LockedChoice,
    None,       ///< frame and box hidden
    HiddenBox,  ///< only the box hidden; the frame stays as it was
};

enum class KeyAction { Leave, Enable, Disable, Hide, PaintGreen };

struct MenuPosition {
    PositionKind kind = PositionKind::None;
    std::string_view frame = {};  ///< caption; empty leaves the frame's earlier caption
    std::optional<CodeTable> choices = std::nullopt;
    KeyAction key = KeyAction::Leave;  ///< what becomes of the soft key beside it
    bool listAboveBox = false;         ///< the list of `choices` is shown above the box as well
};

struct MenuLayout {
    std::int16_t state = 0;
    std::array<MenuPosition, 5> positions;
};

/// The layout of that menu, or null for a state that is laid out elsewhere.
const MenuLayout* menuLayout(std::int16_t state);

/// Caption of a soft key; a key without one is hidden, and so is a `hiddenKey`, which has one.
struct KeyCaption {
    constexpr KeyCaption(const char* caption) : text(caption), visible(!text.empty()) {}
    std::string_view text;
    bool visible;
};

constexpr KeyCaption hiddenKey(const char* caption) {
    KeyCaption key(caption);
    key.visible = false;
    return key;
}

/// Captions of the five soft keys.
using KeyCaptions = std::array<KeyCaption, 5>;

/// A menu of the hard keys: its captions, its word for `FillTextFields` and its pictures.
struct HardKeyMenu {
    std::int16_t state;
    KeyCaptions captions;
    std::string_view word;
};

extern const std::array<HardKeyMenu, 8> kHardKeyMenus;
const HardKeyMenu* hardKeyMenu(std::int16_t state);

}  // namespace zel
