// Small pictures compared with kept ones. With ZEL_GOLDEN=write in the environment they are written
// again: look at them before they are kept.

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <fstream>
#include <iterator>
#include <string>

#include "waterfall/WaterfallPicture.h"

namespace zel {
namespace {

constexpr int kWidth = 120;
constexpr int kHeight = 80;

struct Scene {
    const char* name;
    Projection3D projection;
    GraphView3D view;
    int colourMap;
    int oversampling;
};
constexpr Scene kScenes[] = {
    {"perspective", Projection3D::Perspective, {}, 1, 2},
    {"orthographic", Projection3D::Orthographic, {40, 150, 1.6, 6, 5, 4}, 2, 1},
    {"above", Projection3D::Orthographic, {0, 0, 1, 6, 5, 5}, 4, 1},
};

/// Two carriers, one of which comes and goes, over a ramp.
void fill(Graph3D& graph) {
    graph.setRange(1, 0, 100);
    graph.setRange(2, 0, 19);
    graph.setRange(3, -100, 0);
    for (int row = 0; row < 20; ++row) {
        std::vector<double> x(101);
        std::vector<double> level(101);
        for (int i = 0; i <= 100; ++i) {
            const auto k = static_cast<std::size_t>(i);
            x[k] = i;
            level[k] = -90 + 0.1 * i;
            if (std::abs(i - 30) < 4) level[k] = -20 - 5 * std::abs(i - 30);
            if (std::abs(i - 70) < 8 && row % 8 < 4) level[k] = -45;
        }
        graph.plotCurve(std::vector<double>(101, row), x, level, level);
    }
}

/// The picture on black, as the bytes of a portable pixmap.
std::string pixmapOf(const SurfaceImage& image) {
    std::string bytes =
        "P6 " + std::to_string(image.width) + " " + std::to_string(image.height) + " 255\n";
    for (const Pixel pixel : image.pixels)
        for (const int shift : {16, 8, 0}) bytes += static_cast<char>(pixel >> shift & 0xFFU);
    return bytes;
}

class Golden : public testing::TestWithParam<Scene> {};

TEST_P(Golden, ThePicture_IsTheKeptOne) {
    const Scene& scene = GetParam();
    Form form("Form");
    Graph3D graph(form, "Graph3D");
    fill(graph);
    graph.Projection = scene.projection;
    graph.setView(scene.view);
    PictureStyle style;
    style.colourMap = scene.colourMap;
    style.oversampling = scene.oversampling;
    const std::string drawn = pixmapOf(drawWaterfall(graph, style, kWidth, kHeight, 10).rows);
    const std::string file =
        std::string(ZEL_SOURCE_DIR) + "/tests/waterfall/golden/" + scene.name + ".ppm";
    const char* wish = std::getenv("ZEL_GOLDEN");
    if (wish != nullptr && std::string(wish) == "write")
        std::ofstream(file, std::ios::binary) << drawn;
    std::ifstream stream(file, std::ios::binary);
    const std::string kept{std::istreambuf_iterator<char>(stream), {}};
    ASSERT_EQ(drawn.size(), kept.size());
    // Compilers round differently: a few edges may fall to the neighbour's side.
    constexpr int kVisible = 24;
    std::size_t different = 0;
    for (std::size_t i = 0; i < kept.size(); ++i) {
        const int way = static_cast<unsigned char>(drawn[i]) - static_cast<unsigned char>(kept[i]);
        different += std::abs(way) > kVisible ? 1 : 0;
    }
    EXPECT_LT(different, kept.size() / 100);
}

INSTANTIATE_TEST_SUITE_P(Scenes, Golden, testing::ValuesIn(kScenes),
                         [](const auto& scene) { return std::string(scene.param.name); });

}  // namespace
}  // namespace zel
