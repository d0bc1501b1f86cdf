#pragma once
// Colour maps: from a level between two limits to a colour, by one table of 256.

#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>

namespace zel {

/// 0xAARRGGBB.
using Pixel = std::uint32_t;

class ColourMap {
  public:
    static constexpr int kColours = 256;

    /// By the map style of a plot: 1 is the waterfall's, 4 the spectrogram's; a number without a
    /// map of its own gets the first one.
    static const ColourMap& ofStyle(int style);
    static int count();
    /// 0-based; empty outside. Makes no table: a list of names costs nothing.
    static std::string_view nameAt(int index);
    /// 0-based; null outside.
    static const ColourMap* at(int index);

    std::string_view name() const { return name_; }
    const std::array<Pixel, kColours>& table() const { return table_; }
    Pixel colour(int index) const { return table_[static_cast<std::size_t>(index)]; }

    ColourMap(std::string_view name, const std::array<Pixel, kColours>& table)
        : name_(name), table_(table) {}

  private:
    std::string_view name_;
    std::array<Pixel, kColours> table_;
};

/// From level to a place in a colour map. Levels beyond the limits take the colours of the ends;
/// what is no number, and every level between equal limits, takes the lowest.
class LevelScale {
  public:
    LevelScale(double low, double high);
    double low() const { return low_; }
    double high() const { return high_; }
    /// 0 to 1.
    double part(double level) const;
    int index(double level) const;

  private:
    double low_;
    double high_;
    double factor_;
};

}  // namespace zel
