#include "waterfall/ColourMap.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstddef>
#include <iterator>
#include <numbers>
#include <string_view>
#include <vector>

namespace zel {
namespace {

using Table = std::array<Pixel, ColourMap::kColours>;

struct Rgb {
    double red;
    double green;
    double blue;
};

Pixel pixelOf(const Rgb& colour) {
    const auto byte = [](double part) {
        return static_cast<Pixel>(std::lround(std::clamp(part, 0.0, 1.0) * 255));
    };
    return 0xFF000000U | byte(colour.red) << 16 | byte(colour.green) << 8 | byte(colour.blue);
}

/// A colour by lightness (0 to 1), chroma and hue in degrees, in the perceptual space OKLab.
struct Lch {
    double lightness;
    double chroma;
    double hue;
};

/// Linear light of the three screen colours; outside of 0 to 1 where the screen has no such colour.
Rgb linearOf(const Lch& colour) {
    const double angle = colour.hue * std::numbers::pi / 180;
    const double a = colour.chroma * std::cos(angle);
    const double b = colour.chroma * std::sin(angle);
    const double l = std::pow(colour.lightness + 0.3963377774 * a + 0.2158037573 * b, 3);
    const double m = std::pow(colour.lightness - 0.1055613458 * a - 0.0638541728 * b, 3);
    const double s = std::pow(colour.lightness - 0.0894841775 * a - 1.2914855480 * b, 3);
    return {4.0767416621 * l - 3.3077115913 * m + 0.2309699292 * s,
            -1.2684380046 * l + 2.6097574011 * m - 0.3413193965 * s,
            -0.0041960863 * l - 0.7034186147 * m + 1.7076147010 * s};
}

bool onScreen(const Rgb& linear) {
    constexpr double kSlack = 1e-4;
    const auto fits = [](double part) { return part >= -kSlack && part <= 1 + kSlack; };
    return fits(linear.red) && fits(linear.green) && fits(linear.blue);
}

double encoded(double linear) {
    linear = std::clamp(linear, 0.0, 1.0);
    return linear <= 0.0031308 ? 12.92 * linear : 1.055 * std::pow(linear, 1 / 2.4) - 0.055;
}

/// With as much of the chroma as the screen can show.
Pixel shown(Lch colour) {
    double most = colour.chroma;
    if (!onScreen(linearOf(colour))) {
        double least = 0;
        for (int step = 0; step < 30; ++step) {
            colour.chroma = (least + most) / 2;
            (onScreen(linearOf(colour)) ? least : most) = colour.chroma;
        }
        colour.chroma = least;
    }
    const Rgb linear = linearOf(colour);
    return pixelOf({encoded(linear.red), encoded(linear.green), encoded(linear.blue)});
}

/// Between points that stand apart evenly. Lightness goes in a straight line from the first to the
/// last, so that equal steps of level are equal steps to the eye.
Table through(const std::vector<Lch>& points) {
    Table table{};
    const double last = static_cast<double>(points.size() - 1);
    for (std::size_t i = 0; i < table.size(); ++i) {
        const double part = static_cast<double>(i) / (table.size() - 1);
        const double place = part * last;
        const auto k = std::min(static_cast<std::size_t>(place), points.size() - 2);
        const double between = place - static_cast<double>(k);
        const auto mix = [between](double a, double b) { return a + (b - a) * between; };
        table[i] = shown(
            {points.front().lightness + (points.back().lightness - points.front().lightness) * part,
             mix(points[k].chroma, points[k + 1].chroma), mix(points[k].hue, points[k + 1].hue)});
    }
    return table;
}

/// The "cubehelix" of D. A. Green (Bull. Astr. Soc. India 39, 289, 2011): a helix around the grey
/// line, of steadily rising brightness.
Table cubehelix() {
    constexpr double kStart = 0.5;
    constexpr double kRotations = -1.5;
    constexpr double kHue = 1.0;
    Table table{};
    for (std::size_t i = 0; i < table.size(); ++i) {
        const double part = 0.08 + 0.9 * static_cast<double>(i) / (table.size() - 1);
        const double angle = 2 * std::numbers::pi * (kStart / 3 + 1 + kRotations * part);
        const double amplitude = kHue * part * (1 - part) / 2;
        const double c = std::cos(angle);
        const double s = std::sin(angle);
        table[i] = pixelOf({part + amplitude * (-0.14861 * c + 1.78277 * s),
                            part + amplitude * (-0.29227 * c - 0.90649 * s),
                            part + amplitude * (1.97294 * c)});
    }
    return table;
}

struct Row {
    std::string_view name;
    Table (*make)();
};

/// The map of style n is the nth.
constexpr Row kRows[] = {
    {"Aurora",
     [] {
         return through({{0.22, 0.10, 290},
                         {0, 0.13, 253},
                         {0, 0.10, 216},
                         {0, 0.11, 179},
                         {0, 0.15, 142},
                         {0.95, 0.16, 105}});
     }},
    {"Grey",
     [] {
         return through({{0.16, 0, 0}, {0.98, 0, 0}});
     }},
    {"Cubehelix", cubehelix},
    {"Ember",
     [] {
         return through({{0.15, 0.08, 290},
                         {0, 0.17, 310},
                         {0, 0.20, 365},
                         {0, 0.19, 400},
                         {0, 0.16, 432},
                         {0.97, 0.10, 462}});
     }},
    {"Ice",
     [] {
         return through({{0.15, 0.05, 280}, {0, 0.14, 265}, {0, 0.12, 235}, {0.98, 0.02, 200}});
     }},
};

/// Made when the first picture asks for a colour.
const std::vector<ColourMap>& maps() {
    static const std::vector<ColourMap> all = [] {
        std::vector<ColourMap> made;
        for (const Row& row : kRows) made.emplace_back(row.name, row.make());
        return made;
    }();
    return all;
}

}  // namespace

const ColourMap& ColourMap::ofStyle(int style) {
    const ColourMap* map = at(style - 1);
    return map != nullptr ? *map : maps().front();
}

int ColourMap::count() { return static_cast<int>(std::size(kRows)); }

std::string_view ColourMap::nameAt(int index) {
    return index >= 0 && index < count() ? kRows[index].name : std::string_view();
}

const ColourMap* ColourMap::at(int index) {
    return index >= 0 && index < count() ? &maps()[static_cast<std::size_t>(index)] : nullptr;
}

LevelScale::LevelScale(double low, double high) : low_(low), high_(high) {
    const double height = high - low;
    factor_ = std::isfinite(height) && height != 0 ? 1 / height : 0;
    if (!std::isfinite(factor_)) factor_ = 0;
}

double LevelScale::part(double level) const {
    const double part = (level - low_) * factor_;
    return part > 0 ? std::min(part, 1.0) : 0;
}

int LevelScale::index(double level) const {
    return static_cast<int>(part(level) * (ColourMap::kColours - 1) + 0.5);
}

}  // namespace zel
