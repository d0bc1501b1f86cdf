#pragma once
// The fixed delays that the dialled kinds of connection need, in milliseconds.

#include <cstdint>

#include "forms/ControllerForm.h"

namespace zel {

/// Places of the dialogue where a delay stands.
enum class DelayPlace {
    AfterModeWord,
    AfterCmdKeyword,
    AfterSetKeyword,
    AfterGetKeyword,
    BetweenStatusAndValue,
    AfterTraceGet,
    AfterTraceKeyword,
    AfterComplexGet,
    AfterComplexKeyword,
    ReRequestAfterGet,
    ReRequestAfterKeyword,
};

struct LinkDelay {
    DelayPlace place;
    int modem;     ///< two modems
    int gsm;       ///< two mobile phones
    int gsmModem;  ///< mobile phone to modem
    int other;
};

inline constexpr LinkDelay kLinkDelays[] = {
    {DelayPlace::AfterModeWord, 100, 0, 0, 0},
    {DelayPlace::AfterCmdKeyword, 200, 0, 0, 0},
    {DelayPlace::AfterSetKeyword, 200, 0, 0, 0},
    {DelayPlace::AfterGetKeyword, 300, 0, 0, 0},
    {DelayPlace::BetweenStatusAndValue, 100, 0, 0, 0},
    {DelayPlace::AfterTraceGet, 100, 0, 0, 0},
    {DelayPlace::AfterTraceKeyword, 100, 500, 500, 0},
    {DelayPlace::AfterComplexGet, 200, 0, 0, 0},
    {DelayPlace::AfterComplexKeyword, 200, 0, 0, 0},
    {DelayPlace::ReRequestAfterGet, 100, 0, 0, 0},
    {DelayPlace::ReRequestAfterKeyword, 1900, 1500, 1500, 1500},
};

constexpr int linkDelay(DelayPlace place, std::int16_t connectionKind) {
    for (const LinkDelay& row : kLinkDelays) {
        if (row.place != place) continue;
        if (connectionKind == ControllerForm::MODEMCON) return row.modem;
        if (connectionKind == ControllerForm::GSMCON) return row.gsm;
        if (connectionKind == ControllerForm::GSMMODEMCON) return row.gsmModem;
        return row.other;
    }
    return 0;
}

}  // namespace zel
