#pragma once
// The colours of the light and the dark look.

namespace zel {

struct ThemeColors {
    const char* window;
    const char* base;
    const char* text;
    const char* dim;      ///< what cannot be used now
    const char* caption;  ///< small texts beside fields
    const char* button;
    const char* buttonHover;
    const char* border;
    const char* panel;     ///< frames, one step from the window
    const char* hairline;  ///< edges of frames
    const char* accent;
    const char* accentText;
    const char* yellow;
    const char* yellowText;
    const char* yellowEdge;
    const char* red;
    const char* green;
    const char* focus;    ///< the frame of what has the keyboard
    const char* problem;  ///< texts that cannot be read
    const char* file;     ///< what belongs to a loaded file
};
inline constexpr ThemeColors kDark = {"#12171e", "#0b0f14", "#e6ebf0", "#7d8894", "#aab4bf",
                                      "#232b34", "#2f3a46", "#3a4653", "#19202a", "#2b3541",
                                      "#2873c6", "#ffffff", "#35321f", "#ffd966", "#8f7a30",
                                      "#c0392b", "#1e8449", "#6cb0f5", "#ff7b72", "#8ec9ff"};
inline constexpr ThemeColors kLight = {"#eef1f4", "#ffffff", "#15191e", "#77818b", "#48525c",
                                       "#ffffff", "#e3e9f0", "#9aa5b1", "#f7f9fb", "#cbd3db",
                                       "#1d6fc4", "#ffffff", "#fdf1bf", "#574600", "#c9a93f",
                                       "#c0392b", "#1e8449", "#1d6fc4", "#b3261e", "#1d5ca0"};

}  // namespace zel
