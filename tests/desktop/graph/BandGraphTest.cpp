// The fill between the lowest and the highest level of each point.

#include <limits>
#include <vector>

#include "desktop/graph/BandGraph.h"
#include "desktop/graph/GraphColors.h"
#include "tests/desktop/WindowTest.h"

namespace zel {
namespace {

constexpr double kStop = 3e9;
constexpr std::size_t kValues = 602;
constexpr double kLow = -93;
constexpr double kHigh = -47;

struct BandGraphTest : WindowTest {
    /// Pairs as the program holds them, with points that did not come.
    void plot(std::size_t gapFrom = 1, std::size_t gapTo = 0) {
        std::vector<double> values(kValues);
        for (std::size_t i = 0; i < kValues; ++i) values[i] = i % 2 == 0 ? kLow : kHigh;
        for (std::size_t point = gapFrom; point <= gapTo; ++point)
            values[2 * point] = values[2 * point + 3] = std::numeric_limits<double>::quiet_NaN();
        Graph& graph = panel().CWGraph1;
        graph.setXRange(0, kStop);
        graph.setYRange(-120, -20);
        graph.plotY(values, 0, kStop / (kValues - 1));
        show();  // with a trace the ways to begin go from the graph
    }
    /// The columns between two places of the axis.
    QVector<QRect> columns(double from, double to) {
        window->graph().drawNow();
        const BandGraph* band = nullptr;
        for (int i = 0; i < window->graph().graphCount() && band == nullptr; ++i)
            band = dynamic_cast<const BandGraph*>(window->graph().graph(i));
        if (band == nullptr) return {};
        QVector<QRect> found = band->columns(1);
        const QCPAxis& axis = *window->graph().xAxis;
        found.removeIf([&](const QRect& column) {
            return column.x() < axis.coordToPixel(from) || column.x() >= axis.coordToPixel(to);
        });
        return found;
    }
    bool filled(double x, double level) {
        window->graph().drawNow();
        const QImage seen = window->graph().grab().toImage();
        const QPoint at(static_cast<int>(window->graph().xAxis->coordToPixel(x)),
                        static_cast<int>(window->graph().yAxis->coordToPixel(level)));
        return seen.pixelColor(at) != darkGraph().plotArea;
    }
};

TEST_F(BandGraphTest, ReachesFromTheLowestToTheHighestLevelAndNoFurther) {
    plot();
    for (const double x : {0.11e9, 1.43e9, 2.87e9}) {
        EXPECT_TRUE(filled(x, -73)) << x;
        EXPECT_TRUE(filled(x, kHigh - 2)) << x;
        EXPECT_TRUE(filled(x, kLow + 2)) << x;
        EXPECT_FALSE(filled(x, kHigh + 3)) << x;
        EXPECT_FALSE(filled(x, kLow - 3)) << x;
    }
}

TEST_F(BandGraphTest, PointsThatDidNotCome_AreNotFilled) {
    plot(140, 150);  // of 301, 10 MHz apart
    EXPECT_FALSE(filled(1.452e9, -73));
    EXPECT_TRUE(filled(1.372e9, -73));
    EXPECT_TRUE(filled(1.532e9, -73));
    // No number, no rectangle, wherever it would stand.
    EXPECT_GT(columns(1.3e9, 1.38e9).size(), 10);
    EXPECT_TRUE(columns(1.401e9, 1.499e9).isEmpty());
    EXPECT_GT(columns(1.52e9, 1.6e9).size(), 10);
}

TEST_F(BandGraphTest, CloserView_IsFilledBetweenItsPointsToBothEdges) {
    plot();
    panel().CWGraph1.setXRange(1.4312e9, 1.4466e9);  // one point and parts of two intervals
    for (const double x : {1.4316e9, 1.4353e9, 1.4441e9, 1.4462e9})
        EXPECT_TRUE(filled(x, -73)) << x;
    panel().CWGraph1.setYRange(-85, -60);  // both lines outside
    EXPECT_TRUE(filled(1.4353e9, -73));
    EXPECT_TRUE(filled(1.4353e9, -84));
}

}  // namespace
}  // namespace zel
