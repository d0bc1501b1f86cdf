#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <limits>

#include "waterfall/AxisTicks.h"
#include "waterfall/WaterfallPicture.h"

namespace zel {
namespace {

constexpr int kWidth = 300;
constexpr int kHeight = 240;
constexpr GraphView3D kAbove{0, 0, 1, 6, 5, 5};

struct RendererTest : ::testing::Test {
    Form form{"Form"};
    Graph3D graph{form, "Graph3D"};
    PictureStyle style;

    RendererTest() {
        graph.setRange(1, 0, 600);
        graph.setRange(2, 0, 9);
        graph.setRange(3, -100, 0);
    }

    /// A row of one level with a carrier of 20 samples around `at`.
    void row(double depth, double floor, int at = -1, double carrier = 0) {
        std::vector<double> x(601);
        std::vector<double> level(601, floor);
        for (int i = 0; i <= 600; ++i) {
            x[static_cast<std::size_t>(i)] = i;
            if (at >= 0 && std::abs(i - at) <= 10) level[static_cast<std::size_t>(i)] = carrier;
        }
        graph.plotCurve(std::vector<double>(601, depth), x, level, level);
    }
    void rows() {
        for (int i = 0; i < 10; ++i) row(i, -80, 200, -10);
    }
    void fromAbove() {
        graph.Projection = Projection3D::Orthographic;
        graph.setView(kAbove);
    }
    WaterfallPicture draw(int width = kWidth, int height = kHeight) const {
        return drawWaterfall(graph, style, width, height, 12);
    }
    Pixel colourOf(double level) const {
        return ColourMap::ofStyle(0).colour(LevelScale(-100, 0).index(level));
    }
    /// Pixels that are drawn.
    static int drawn(const SurfaceImage& image) {
        int count = 0;
        for (const Pixel pixel : image.pixels) count += pixel != 0 ? 1 : 0;
        return count;
    }
};

TEST_F(RendererTest, FromAbove_ACarrierStandsAtItsXInAllRowsInTheColourOfItsLevel) {
    rows();
    fromAbove();
    const WaterfallPicture picture = draw();
    const Camera camera(kAbove, false, kWidth, kHeight);
    for (int i = 0; i < 10; ++i) {
        const double y = 10.0 * i / 9;
        if (i == 0 || i == 9) continue;  // half of them lies outside of the box
        const ScreenPoint on = camera.project({12.0 * 200 / 600, y, 9});
        const ScreenPoint off = camera.project({12.0 * 400 / 600, y, 2});
        EXPECT_EQ(picture.rows.at(static_cast<int>(on.x), static_cast<int>(on.y)), colourOf(-10));
        EXPECT_EQ(picture.rows.at(static_cast<int>(off.x), static_cast<int>(off.y)), colourOf(-80));
    }
}

TEST_F(RendererTest, FromAbove_TheRowsLeaveNoGaps) {
    rows();
    fromAbove();
    const WaterfallPicture picture = draw();
    const Camera camera(kAbove, false, kWidth, kHeight);
    const ScreenPoint low = camera.project({0, 0, 0});
    const ScreenPoint high = camera.project({12, 10, 0});
    for (int y = static_cast<int>(high.y) + 1; y < static_cast<int>(low.y); ++y)
        for (int x = static_cast<int>(low.x) + 1; x < static_cast<int>(high.x); ++x)
            ASSERT_NE(picture.rows.at(x, y), 0U) << x << ", " << y;
}

TEST_F(RendererTest, NearerRows_HideFartherOnes) {
    row(0, -1);   // near, and high
    row(9, -50);  // far, and low: hidden by the first all the way
    graph.setView({80, 0, 2.8, 6, 5, 5});
    const int both = drawn(draw().rows);
    const auto over = draw().rows;
    Form otherForm("Form");
    Graph3D alone(otherForm, "Graph3D");
    for (int i = 1; i <= 3; ++i) alone.setRange(i, graph.axis(i).Minimum, graph.axis(i).Maximum);
    const GraphCurve3D& first = graph.plots().front();
    alone.plotCurve(first.depth, first.x, first.level, first.colour);
    alone.setView(graph.view());
    const auto one = drawWaterfall(alone, style, kWidth, kHeight, 12).rows;
    EXPECT_GT(both, 0);
    for (std::size_t i = 0; i < one.pixels.size(); ++i)
        if (one.pixels[i] != 0) {
            ASSERT_EQ(over.pixels[i], one.pixels[i]) << i;
        }
}

TEST_F(RendererTest, FromTheOtherSide_TheOtherRowIsNearer) {
    row(0, -1);
    row(9, -50, 300, -1);
    graph.setView({75, 180, 2.8, 6, 5, 5});
    const auto hit = pointAt(graph, style, kWidth, kHeight, {kWidth / 2.0, kHeight / 2.0});
    ASSERT_TRUE(hit);
    EXPECT_EQ(hit->plot, 1);
    graph.setView({75, 0, 2.8, 6, 5, 5});
    EXPECT_EQ(pointAt(graph, style, kWidth, kHeight, {kWidth / 2.0, kHeight / 2.0})->plot, 0);
}

class Views : public RendererTest,
              public ::testing::WithParamInterface<std::tuple<double, double, bool>> {};

/// The exact renderer, which covers nothing in advance, is the yardstick: a camera whose floor is
/// seen edge on cannot use that.
TEST_P(Views, APictureAt360DegreesMore_IsTheSame) {
    rows();
    const auto [latitude, longitude, perspective] = GetParam();
    graph.Projection = perspective ? Projection3D::Perspective : Projection3D::Orthographic;
    graph.setView({latitude, longitude, perspective ? 2.8 : 1.0, 6, 5, 5});
    const auto once = draw();
    graph.setView({latitude, longitude + 360, perspective ? 2.8 : 1.0, 6, 5, 5});
    const auto again = draw();
    EXPECT_EQ(once.rows.pixels, again.rows.pixels);
    EXPECT_GT(drawn(once.rows), kWidth * kHeight / 20);
}

TEST_P(Views, OneThreadAndTwo_DrawTheSame) {
    rows();
    const auto [latitude, longitude, perspective] = GetParam();
    graph.Projection = perspective ? Projection3D::Perspective : Projection3D::Orthographic;
    graph.setView({latitude, longitude, 2, 6, 5, 5});
    style.threads = 1;
    const auto one = draw();
    style.threads = 2;
    EXPECT_EQ(one.rows.pixels, draw().rows.pixels);
}

TEST_P(Views, TheBox_HasNoHoles) {
    // Rows at the top of the box are a solid block: within its outline nothing shines through.
    for (int i = 0; i < 10; ++i) row(i, -0.001 * i);
    const auto [latitude, longitude, perspective] = GetParam();
    graph.Projection = perspective ? Projection3D::Perspective : Projection3D::Orthographic;
    graph.setView({latitude, longitude, perspective ? 4.0 : 2.0, 6, 5, 5});
    const auto image = draw().rows;
    for (int x = 0; x < image.width; ++x) {
        int first = -1;
        int last = -1;
        int count = 0;
        for (int y = 0; y < image.height; ++y) {
            if (image.at(x, y) == 0) continue;
            if (first < 0) first = y;
            last = y;
            ++count;
        }
        if (count > 0) {
            ASSERT_EQ(count, last - first + 1) << x;
        }
    }
}

INSTANTIATE_TEST_SUITE_P(Cameras, Views,
                         ::testing::Combine(::testing::Values(0.0, 20.0, 58.0, 85.0, 90.0, 120.0),
                                            ::testing::Values(-325.0, 0.0, 90.0, 135.0, 260.0),
                                            ::testing::Bool()));

TEST_F(RendererTest, Oversampling_IsTheMean) {
    rows();
    style.oversampling = 2;
    const auto fine = draw();
    EXPECT_EQ(fine.rows.width, kWidth);
    int partly = 0;
    for (const Pixel pixel : fine.rows.pixels)
        partly += pixel >> 24 != 0 && pixel >> 24 != 255 ? 1 : 0;
    EXPECT_GT(partly, 50);
}

TEST_F(RendererTest, Dots_MakeTheRowsFinerAndLeaveLinesAndTexts) {
    rows();
    const auto plain = draw();
    const auto twice = draw(2 * kWidth, 2 * kHeight);
    style.dots = 2;
    const auto fine = draw();
    EXPECT_EQ(fine.rows.width, 2 * kWidth);
    EXPECT_EQ(fine.rows.height, 2 * kHeight);
    EXPECT_EQ(fine.rows.pixels, twice.rows.pixels);
    ASSERT_EQ(fine.texts.size(), plain.texts.size());
    for (std::size_t i = 0; i < fine.texts.size(); ++i) {
        EXPECT_EQ(fine.texts[i].at.x, plain.texts[i].at.x);
        EXPECT_EQ(fine.texts[i].text, plain.texts[i].text);
    }
    for (const double none : {0.0, -1.0, std::numeric_limits<double>::quiet_NaN()}) {
        style.dots = none;
        EXPECT_EQ(draw().rows.width, kWidth);
    }
}

TEST_F(RendererTest, PointAt_NamesTheSample) {
    rows();
    fromAbove();
    const Camera camera(kAbove, false, kWidth, kHeight);
    const ScreenPoint on = camera.project({12.0 * 200 / 600, 10.0 * 4 / 9, 9});
    const auto hit = pointAt(graph, style, kWidth, kHeight, on);
    ASSERT_TRUE(hit);
    EXPECT_EQ(hit->plot, 4);
    EXPECT_NEAR(hit->sample, 200, 3);
    EXPECT_FALSE(pointAt(graph, style, kWidth, kHeight, {0, 0}));
    EXPECT_FALSE(pointAt(graph, style, kWidth, kHeight, {-5, 10}));
    EXPECT_FALSE(pointAt(graph, style, kWidth, kHeight, {1e9, 10}));
}

TEST_F(RendererTest, LevelsThatAreNoNumbersOrFarOutside_GiveAPicture) {
    const double nan = std::numeric_limits<double>::quiet_NaN();
    const double infinite = std::numeric_limits<double>::infinity();
    graph.plotCurve({0, 0, 0, 0}, {0, 200, 400, 600}, {nan, -1e300, 1e300, infinite}, {});
    graph.plotCurve({1, 1}, {0, 600}, {nan, nan}, {});
    graph.plotCurve({nan, nan}, {0, 600}, {-10, -20}, {});
    graph.plotCurve({2}, {nan, infinite, -infinite}, {-10, -20, -30}, {});
    graph.plotCurve({3}, {300}, {-10}, {});
    graph.plotCurve({}, {}, {}, {});
    EXPECT_GT(drawn(draw().rows), 0);
}

TEST_F(RendererTest, RowsOfDifferentLength_AreAllDrawn) {
    fromAbove();
    for (int i = 0; i < 10; ++i) {
        const std::size_t count = i % 2 == 0 ? 2 : 601;
        std::vector<double> x(count);
        for (std::size_t k = 0; k < count; ++k)
            x[k] = 600.0 * static_cast<double>(k) / static_cast<double>(count - 1);
        graph.plotCurve(std::vector<double>(count, i), x, std::vector<double>(count, -50), {});
    }
    const auto image = draw();
    EXPECT_EQ(image.rows.at(kWidth / 2, kHeight / 2 - 5), colourOf(-50));
    EXPECT_EQ(image.rows.at(kWidth / 2, kHeight / 2 + 15), colourOf(-50));
}

TEST_F(RendererTest, AxesOfNoHeightOrNoNumbers_GiveAPicture) {
    rows();
    for (const double end : {0.0, std::numeric_limits<double>::quiet_NaN(), 1e308}) {
        for (int axis = 1; axis <= 3; ++axis) {
            graph.setRange(axis, end, end);
            EXPECT_EQ(draw().rows.width, kWidth);
        }
    }
    graph.setRange(1, -1e308, 1e308);
    EXPECT_EQ(draw().rows.width, kWidth);
}

TEST_F(RendererTest, CamerasWithoutSense_GiveAPicture) {
    rows();
    const double nan = std::numeric_limits<double>::quiet_NaN();
    for (const GraphView3D& view :
         {GraphView3D{nan, nan, nan, nan, nan, nan}, GraphView3D{58, -325, 0, 6, 5, 5},
          GraphView3D{58, -325, -3, 6, 5, 5}, GraphView3D{1e300, -1e300, 1e300, 1e300, 0, 0},
          GraphView3D{58, 35, 0.1, 6, 5, 5}, GraphView3D{90, 0, 0.3, 6, 5, 0}}) {
        for (const Projection3D projection :
             {Projection3D::Perspective, Projection3D::Orthographic}) {
            graph.Projection = projection;
            graph.setView(view);
            EXPECT_EQ(draw().rows.width, kWidth);
            pointAt(graph, style, kWidth, kHeight, {kWidth / 2.0, kHeight / 2.0});
        }
    }
}

TEST_F(RendererTest, DistanceZero_IsDrawnAsATenth) {
    rows();
    graph.Projection = Projection3D::Orthographic;
    graph.setView({58, 30, -4, 6, 5, 5});
    const auto atNothing = draw();
    graph.setView({58, 30, 0.1, 6, 5, 5});
    EXPECT_EQ(atNothing.rows.pixels, draw().rows.pixels);
}

TEST_F(RendererTest, PicturesOfAnySize_AreDrawn) {
    rows();
    for (const auto& [width, height] : {std::pair{1, 1}, {0, 0}, {-5, 7}, {1, 300}, {300, 1}}) {
        const auto picture = draw(width, height);
        EXPECT_EQ(picture.rows.width, std::max(width, 1));
        EXPECT_EQ(picture.rows.height, std::max(height, 1));
    }
}

TEST_F(RendererTest, EmptyGraph_ShowsItsBox) {
    const auto picture = draw();
    EXPECT_EQ(drawn(picture.rows), 0);
    EXPECT_FALSE(picture.behind.empty());
    EXPECT_FALSE(picture.texts.empty());
}

TEST_F(RendererTest, AxisTexts_BearPrefixAndUnit) {
    graph.setRange(1, 0, 3e9);
    graph.setFormat(1, "k\"Hz\"");
    graph.setFormat(3, "k\"dBm\"");
    rows();
    std::vector<std::string> texts;
    for (const PictureText& text : draw(900, 600).texts) texts.push_back(text.text);
    const auto has = [&texts](const std::string& text) {
        return std::find(texts.begin(), texts.end(), text) != texts.end();
    };
    EXPECT_TRUE(has("1 GHz"));
    EXPECT_TRUE(has("500 MHz"));
    EXPECT_TRUE(has("-40 dBm"));
}

TEST_F(RendererTest, LevelTicks_FollowTheirFlag) {
    graph.setFormat(3, "k\"dBm\"");
    graph.LevelTicks = false;
    for (const PictureText& text : draw(900, 600).texts)
        EXPECT_EQ(text.text.find("dBm"), std::string::npos);
}

TEST_F(RendererTest, Labels_StandAtTheirRows) {
    graph.setFormat(1, "k\"Hz\"");
    for (int i = 0; i < 10; ++i) {
        graph.stampNext(i + 1, "t");
        row(i, -50);
    }
    graph.setValuePair(2, 6, {"12:00:05     ", 6});
    const auto picture = draw(900, 600);
    const auto found = std::find_if(picture.texts.begin(), picture.texts.end(),
                                    [](const auto& text) { return text.text == "12:00:05"; });
    ASSERT_NE(found, picture.texts.end());
    const Camera camera(graph.view(), true, 900, 600);
    // On the screen the text lies level with its row on an edge of the floor.
    const double left = camera.project({0, 10.0 * 5 / 9, 0}).y;
    const double right = camera.project({12, 10.0 * 5 / 9, 0}).y;
    EXPECT_LT(std::min(std::fabs(found->at.y - left), std::fabs(found->at.y - right)), 15);
}

TEST_F(RendererTest, Labels_AreLeftOutAtEvenSteps) {
    graph.setFormat(1, "k\"Hz\"");
    graph.setRange(2, 0, 99);
    for (int i = 0; i < 100; ++i) {
        graph.stampNext(i + 1, "t");
        row(i, -50);
        if (i % 4 == 0)
            graph.setValuePair(2, i + 1, {"12:" + std::to_string(10 + i / 4) + ":00", i + 1.0});
    }
    for (const auto& [width, height] : {std::pair{900, 600}, {1700, 900}, {500, 300}}) {
        std::vector<int> minutes;
        for (const PictureText& text : draw(width, height).texts)
            if (text.text.size() == 8 && text.text.substr(5) == ":00")
                minutes.push_back(std::stoi(text.text.substr(3, 2)));
        ASSERT_GT(minutes.size(), 2U) << width;
        EXPECT_EQ(minutes.front(), 34) << width;  // the newest
        for (std::size_t i = 2; i < minutes.size(); ++i)
            EXPECT_EQ(minutes[i] - minutes[i - 1], minutes[1] - minutes[0]) << width;
    }
}

TEST_F(RendererTest, LabelsThatComeInCrowds_AreShownWhereThereIsRoom) {
    graph.setRange(2, 0, 99);
    for (int i = 0; i < 100; ++i) {
        graph.stampNext(i + 1, "t");
        row(i, -50);
        if (i % 10 == 0 || (i > 40 && i < 46))
            graph.setValuePair(2, i + 1, {"time " + std::to_string(i), i + 1.0});
    }
    int shown = 0;
    for (const PictureText& text : draw(900, 600).texts)
        shown += text.text.starts_with("time") ? 1 : 0;
    EXPECT_GE(shown, 9);
}

TEST_F(RendererTest, SingleLevels_AreDbmWhereTheNumbersOfTheAxisAreHidden) {
    graph.setFormat(3, "k\"dBuV\"");
    EXPECT_EQ(levelFormat(graph), "k\"dBuV\"");
    graph.setFormat(3, "%");
    EXPECT_EQ(levelFormat(graph), "%");
    graph.setLabelColor(3, graph.BackColor);
    EXPECT_EQ(levelFormat(graph), "k\"dBm\"");
    // The marker bears it.
    row(4, -80, 300, -10);
    graph.addCursor();
    GraphCursor3D cursor = graph.cursors()[0];
    cursor.X = 300;
    cursor.Y = 4;
    cursor.Z = -10;
    cursor.placed = true;
    graph.setCursor(0, cursor);
    const auto texts = draw().texts;
    EXPECT_TRUE(std::any_of(texts.begin(), texts.end(), [](const PictureText& text) {
        return text.marker && text.text.find("-10 dBm") != std::string::npos;
    }));
}

TEST_F(RendererTest, LimitsByHand_AndOfTheRows_ReplaceTheAxis) {
    row(0, -60, 100, -20);
    style.levels = LevelSource::Rows;
    EXPECT_EQ(pictureLimits(graph, style).low, -60);
    EXPECT_EQ(pictureLimits(graph, style).high, -20);
    style.levels = LevelSource::ByHand;
    style.low = -30;
    style.high = -70;
    EXPECT_EQ(pictureLimits(graph, style).low, -70);
    style.high = -30;  // of no height
    EXPECT_EQ(pictureLimits(graph, style).high, 0);
}

TEST_F(RendererTest, DepthRows_ShowTheNewest) {
    for (int i = 0; i < 10; ++i) row(i, -50);
    style.depthRows = 4;
    EXPECT_EQ(pictureLimits(graph, style).firstDepth, 6);
    EXPECT_EQ(pictureLimits(graph, style).lastDepth, 9);
}

TEST(ColourMapTest, EveryMap_GetsLighterInEvenSteps) {
    const auto luminance = [](Pixel pixel) {
        const auto linear = [](Pixel part) { return std::pow((part & 0xFF) / 255.0, 2.2); };
        return 0.2126 * linear(pixel >> 16) + 0.7152 * linear(pixel >> 8) + 0.0722 * linear(pixel);
    };
    for (int i = 0; i < ColourMap::count(); ++i) {
        const ColourMap& map = *ColourMap::at(i);
        double last = -1;
        for (int k = 0; k < ColourMap::kColours; k += 16) {
            const double lightness = std::cbrt(luminance(map.colour(k)));
            EXPECT_GT(lightness, last) << map.name() << " " << k;
            if (last >= 0) {
                EXPECT_LT(lightness - last, 0.13) << map.name() << " " << k;
            }
            last = lightness;
        }
    }
}

TEST(ColourMapTest, UnknownStyle_HasTheFirstMap) {
    EXPECT_EQ(&ColourMap::ofStyle(77), ColourMap::at(0));
    EXPECT_EQ(&ColourMap::ofStyle(4), ColourMap::at(3));
    EXPECT_EQ(ColourMap::at(-1), nullptr);
}

TEST(ColourMapTest, NameInTheList_IsThatOfTheMap) {
    for (int i = 0; i < ColourMap::count(); ++i)
        EXPECT_EQ(ColourMap::nameAt(i), ColourMap::at(i)->name()) << i;
    EXPECT_EQ(ColourMap::nameAt(0), "Aurora");
    EXPECT_EQ(ColourMap::nameAt(-1), "");
    EXPECT_EQ(ColourMap::nameAt(ColourMap::count()), "");
}

TEST(LevelScaleTest, EndsAndNoNumbers) {
    const LevelScale scale(-100, 0);
    EXPECT_EQ(scale.index(-100), 0);
    EXPECT_EQ(scale.index(0), 255);
    EXPECT_EQ(scale.index(-50), 128);
    EXPECT_EQ(scale.index(1e300), 255);
    EXPECT_EQ(scale.index(std::nan("")), 0);
    EXPECT_EQ(LevelScale(5, 5).index(7), 0);
    EXPECT_EQ(LevelScale(-1e308, 1e308).index(7), 0);
}

}  // namespace
}  // namespace zel
