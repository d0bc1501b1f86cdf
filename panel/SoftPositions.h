#pragma once
// The soft positions as one table: what each position of each menu shows, asks, sends and stores.

#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <string_view>

#include "forms/ControllerForm.h"
#include "model/CodeTables.h"
#include "model/MirrorField.h"
#include "model/ZEL3Variables.h"

namespace zel {

enum class PositionKind {
    None,       ///< frame and box hidden
    Box,        ///< an entry box
    LockedBox,  ///< shows, takes no entry
    Choice,     ///< a drop-down list in the box's place
    LockedChoice,
    HiddenBox,  ///< only the box hidden; the frame stays as it was
};

/// What becomes of the soft key when its menu is laid out.
enum class KeyAction { Leave, Enable, Disable, Hide, PaintGreen };

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

/// What a key does where it does more, or something else, than to ask its word.
enum class KeyQuirk {
    Asks,
    StartFrequency,
    StopFrequency,
    FullSpan,
    ZeroSpan,
    LastSpan,
    ReferenceLevel,
    Bandwidth,
    AutoBandwidth,
    AutoSweepTime,
    TriggerSource,
    TriggerValue,
    SingleTrace,
    Marker,
    TransducerMenu,
    LimitMenu,
    TransducerOff,
    LeaveSubMenu,
    ChannelPower,
    ChannelPowerUnit,
    LevelAdjust,
    None,
};

/// Where the value of an entry comes from.
enum class EntrySource {
    None,         ///< nothing is sent
    Value,        ///< the box, a number with prefix
    LocaleValue,  ///< the same, written with its zero before the point
    Whole,        ///< the same, cut to a whole number of 32 bits; one that has more is refused
    Word,         ///< the same, as a 16-bit number; one that has more is refused
    Choice,       ///< index of the list
    Text,         ///< the box, trimmed
};

/// What an entry does after its value was sent, or in its place.
enum class EntryQuirk {
    Sends,
    AfterCentre,
    AfterOffset,
    AfterBandwidth,
    AfterSweepTime,
    ManualSpan,  // from here on in its place
    StartFrequency,
    StopFrequency,
    ZeroSpan,
    AutoSweepTime,
    SweepMode,
    TriggerSource,
    TriggerValue,
    Marker,
    MeasurementMode,
};

/// What ends a typed number on the desktop.
enum class EntryUnit {
    Enter,  ///< nothing but the Enter key
    Hertz,
    Seconds,
    WholeSeconds,
    Level,
    Decibels,
    Percent,  ///< of the height of the display
    Metres,
    MarkerX,       ///< of the x axis
    TriggerValue,  ///< level or delay, as the key has it
};

/// How the position gets its value when its menu is filled.
enum class Fill { None, Shows, Asks };

class MenuFill;

/// A row. The wire's word serves the query, the setting and the filling, but where a row says
/// otherwise.
struct SoftPosition {
    std::int16_t state;
    int key;
    KeyCaption caption = "";
    std::string_view frame = {};  ///< empty leaves the frame's earlier caption
    PositionKind kind = PositionKind::None;
    std::optional<CodeTable> codes = std::nullopt;         ///< captions of a query, choices
    std::optional<CodeTable> listAboveBox = std::nullopt;  ///< a list shown above the box
    KeyAction action = KeyAction::Leave;

    const char* word = "";
    const char* unit = "";  ///< of an answer
    MirrorField field{};
    bool leadingNumber = false;  ///< the field takes the answer, not the text that is shown
    KeyQuirk onKey = KeyQuirk::Asks;

    EntrySource source = EntrySource::None;
    EntryQuirk onEntry = EntryQuirk::Sends;
    const char* setWord = nullptr;                       ///< null: `word`
    std::optional<MirrorField> setField = std::nullopt;  ///< nothing: `field`
    EntryUnit entryUnit = EntryUnit::Enter;

    Fill fill = Fill::None;
    std::optional<MirrorField> fillField = std::nullopt;  ///< nothing: `field`
    int fillTurn = 0;  ///< questions of a menu go out by their turns, then by their keys
    const char* fillUnit = nullptr;  ///< null: `unit`
    /// Whether the question makes sense now; null: always.
    bool (*fillAsks)(const ControllerForm& panel, const ZEL3Variables& mirror) = nullptr;
    /// The text of the box; null: the field with its unit.
    std::string (*fillText)(const ZEL3Variables& mirror, const MenuFill& fill) = nullptr;

    const char* wordToSet() const { return setWord != nullptr ? setWord : word; }
    const MirrorField& fieldToSet() const { return setField ? *setField : field; }
    const MirrorField& fieldToFill() const { return fillField ? *fillField : field; }
};

/// All rows, in the order in which the operations of the menus run.
std::span<const SoftPosition> softPositions();
/// The five rows of a menu; none for a state that has no menu.
std::span<const SoftPosition> softPositions(std::int16_t state);
/// The row of a key, or null.
const SoftPosition* softPosition(std::int16_t state, int key);
/// The menu's word for `FillTextFields`; empty for a menu that is not filled.
std::string_view menuWord(std::int16_t state);
/// The menu of a word, or 0.
std::int16_t menuOf(std::string_view word);

}  // namespace zel
