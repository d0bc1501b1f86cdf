#include "bench/Redraw.h"

#include <QApplication>
#include <cstddef>
#include <random>
#include <vector>

#include "bench/Figures.h"
#include "desktop/graph/GraphWidget.h"
#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "model/ZEL3Variables.h"
#include "trace/ViewAnnotations.h"

namespace zelbench {
namespace {

constexpr std::size_t kPoints = 602;
constexpr int kRedraws = 300;
constexpr double kLimit = 4e-3;  // seconds
constexpr double kSpan = 3e9;    // Hz

}  // namespace

Figure graphRedraw() {
    zel::Forms forms;
    zel::ZEL3Variables mirror;
    zel::ControllerForm& panel = forms.controller;
    panel.CWGraph1.setXRange(0, kSpan);
    panel.CWGraph1.setYRange(-120, -20);
    zel::GraphWidget widget(panel.CWGraph1, [&] { return zel::annotateView(panel, mirror); });
    widget.setMinimumSize(0, 0);
    widget.resize(900, 500);
    widget.show();
    QApplication::processEvents();

    std::mt19937 random(1);
    std::uniform_real_distribution<double> noise(-100, -85);
    std::vector<double> redraws;
    for (int i = 0; i < kRedraws; ++i) {
        std::vector<double> values(kPoints);
        for (double& value : values) value = noise(random);
        values[kPoints / 2] = -30;
        panel.CWGraph1.plotY(values, 0, kSpan / (kPoints - 1));
        // To the pixels of the window, painting included.
        redraws.push_back(timeOf([&] {
            widget.drawNow();
            widget.repaint();
        }));
    }
    const double measured = median(redraws);
    return {"(d) redraw of 602 points at 900x500",
            timeText(measured),
            timeText(kLimit),
            measured / kLimit,
            1,
            false,
            ""};
}

}  // namespace zelbench
