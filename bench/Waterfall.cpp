#include "bench/Waterfall.h"

#include <sys/resource.h>

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <random>
#include <string>
#include <vector>

#include "bench/Figures.h"
#include "forms/Forms.h"
#include "platform/Graph3D.h"
#include "waterfall/Graph3dOps.h"
#include "waterfall/SpectrogramImage.h"
#include "waterfall/SweepHistory.h"
#include "waterfall/WaterfallPicture.h"

namespace zelbench {
namespace {

constexpr int kRows = 100;
constexpr std::size_t kPoints = 602;
constexpr int kFrames = 120;
constexpr double kRowLimit = 0.3e-3;  // seconds

/// Noise with two carriers and a burst.
class Sweeps {
  public:
    Sweeps() : x_(kPoints) {
        for (std::size_t i = 0; i < kPoints; ++i) x_[i] = static_cast<double>(i) * 1e6;
    }
    void add(zel::Forms& forms, int row) {
        std::vector<double> levels(kPoints);
        for (std::size_t i = 0; i < kPoints; ++i) {
            const double place = static_cast<double>(i) / kPoints;
            levels[i] = -100 + noise_(random_);
            levels[i] = std::max(levels[i], -40 - std::pow((place - 0.3) * 80, 2));
            if (row % 20 < 10 && place > 0.7 && place < 0.8) levels[i] = -70 + noise_(random_);
        }
        forms.controller.CWGraph1.plotY(levels, 0, 1e6);
        forms.controller.RawTraceData = levels;
        forms.waterfall.limitRows(kRows);
        forms.waterfall.stampRow("12:00:00");
        forms.waterfall.Graph3D.plotCurve(std::vector<double>(kPoints, row), x_, levels, levels);
        forms.waterfall.styleLastRow();
    }

  private:
    std::mt19937 random_{1};
    std::normal_distribution<double> noise_{0, 3};
    std::vector<double> x_;
};

struct Filled {
    zel::Forms forms;
    zel::Graph3dOps ops{forms.waterfall};
    zel::SweepHistory history{forms};
    Sweeps sweeps;
    explicit Filled(int rows) {
        forms.waterfall.Graph3D.setRange(1, 0, 601e6);
        forms.waterfall.Graph3D.setRange(3, -120, -20);
        for (int i = 0; i < rows; ++i) sweeps.add(forms, i);
    }
};

/// The most that the process ever held in memory, bytes.
double peakBytes() {
    rusage usage{};
    getrusage(RUSAGE_SELF, &usage);
    return static_cast<double>(usage.ru_maxrss) * 1024;
}

}  // namespace

Figure waterfallFrames(int width, int height, int threads, double wanted) {
    Filled rows(kRows);
    zel::Graph3D& graph = rows.forms.waterfall.Graph3D;
    zel::PictureStyle style;
    style.threads = threads;
    std::vector<double> frames;
    for (int i = 0; i < kFrames; ++i) {
        zel::GraphView3D view = graph.view();
        view.Longitude += 3;
        graph.setView(view);
        frames.push_back(timeOf([&] { zel::drawWaterfall(graph, style, width, height, 14); }));
    }
    const double rate = 1 / median(frames);
    return {"(m) waterfall of 100 x 602 at " + std::to_string(width) + "x" +
                std::to_string(height) + ", " + std::to_string(threads) + " thread" +
                (threads == 1 ? "" : "s"),
            numberText(rate) + " pictures/s",
            numberText(wanted) + " pictures/s",
            rate / wanted,
            1,
            true,
            ""};
}

Figure spectrogramRow() {
    Filled rows(kRows);
    zel::SpectrogramImage image(rows.history);
    const zel::SpectrogramFrame frame{900, 0, 601e6, -120, -20, 4};
    image.update(frame);
    std::vector<double> times;
    for (int i = 0; i < 500; ++i) {
        rows.sweeps.add(rows.forms, kRows + i);
        times.push_back(timeOf([&] { image.update(frame); }));
    }
    const double measured = median(times);
    return {"(m) a new row of the spectrogram, 900 pixels",
            timeText(measured),
            timeText(kRowLimit),
            measured / kRowLimit,
            1,
            false,
            ""};
}

Figure waterfallGrowth() {
    constexpr int kMany = 100000;
    Filled rows(kMany / 10);
    const double before = peakBytes();
    for (int i = kMany / 10; i < kMany; ++i) rows.sweeps.add(rows.forms, i);
    const double after = peakBytes();
    return {"(m) memory after 100,000 rows",
            numberText(after / 1e6) + " MB",
            "after 10,000 rows, " + numberText(before / 1e6) + " MB",
            after / before,
            1.02,
            false,
            ""};
}

}  // namespace zelbench
