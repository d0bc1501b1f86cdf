#include "waterfall/PictureOptions.h"

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <iterator>
#include <optional>
#include <string>

#include "forms/WaterfallForm.h"
#include "platform/Controls.h"
#include "platform/Graph3D.h"
#include "support/NumberText.h"
#include "support/Text.h"
#include "waterfall/AxisTicks.h"
#include "waterfall/ColourMap.h"
#include "waterfall/SurfaceRenderer.h"
#include "waterfall/WaterfallPicture.h"

namespace zel {
namespace {

enum LevelChoice { kByAxis, kByRows, kByHand };
constexpr int kDepths[] = {0, 25, 50, 100};

std::optional<double> number(const std::string& text) {
    return parseNumber(replaceAll(text, ",", "."));
}

}  // namespace

PictureOptions::PictureOptions(WaterfallForm& form) : form_(form) {
    form_.ColourMapList.AddItem("Automatic");
    for (int i = 0; i < ColourMap::count(); ++i)
        form_.ColourMapList.AddItem(std::string(ColourMap::nameAt(i)));
    for (const int rows : kDepths)
        form_.DepthList.AddItem(rows == 0 ? "As recorded" : std::to_string(rows) + " rows");
    for (const char* source : {"Reference level", "Automatic", "By hand"})
        form_.LevelsList.AddItem(source);
    for (DropDownList* list : {&form_.ColourMapList, &form_.DepthList, &form_.LevelsList}) {
        list->setListIndex(0);
        // The picture follows the lists.
        handlers_.on(list->Changed, [this] { form_.Graph3D.noteChange(); });
    }
    for (TextBox* box : {&form_.LevelMinBox, &form_.LevelMaxBox}) {
        box->Enabled = false;
        handlers_.on(box->Changed, [this] { form_.Graph3D.noteChange(); });
    }
    handlers_.on(form_.LevelsList.Clicked, [this] { LevelsList_Click(); });
}

void PictureOptions::LevelsList_Click() {
    const bool byHand = form_.LevelsList.ListIndex() == kByHand;
    form_.LevelMinBox.Enabled = byHand;
    form_.LevelMaxBox.Enabled = byHand;
    if (!byHand || !form_.LevelMinBox.Text.get().empty()) return;
    form_.LevelMinBox.Text = generalNumber(form_.Graph3D.axis(3).Minimum);
    form_.LevelMaxBox.Text = generalNumber(form_.Graph3D.axis(3).Maximum);
}

PictureStyle pictureStyle(const WaterfallForm& form) {
    PictureStyle style;
    style.colourMap = std::max(form.ColourMapList.ListIndex(), 0);
    const int depth = form.DepthList.ListIndex();
    if (depth > 0 && depth < static_cast<int>(std::size(kDepths))) style.depthRows = kDepths[depth];
    if (form.LevelsList.ListIndex() == kByRows) style.levels = LevelSource::Rows;
    const std::optional<double> low = number(form.LevelMinBox.Text);
    const std::optional<double> high = number(form.LevelMaxBox.Text);
    if (form.LevelsList.ListIndex() == kByHand && low && high) {
        style.levels = LevelSource::ByHand;
        style.low = *low;
        style.high = *high;
    }
    return style;
}

std::string sampleText(const Graph3D& graph, const SurfaceHit& hit) {
    if (hit.plot < 0 || hit.plot >= graph.plotCount()) return "";
    const GraphCurve3D& plot = graph.plots()[static_cast<std::size_t>(hit.plot)];
    const auto i = static_cast<std::size_t>(hit.sample);
    if (i >= plot.x.size() || i >= plot.level.size()) return "";
    const double step = std::fabs(graph.axis(1).Maximum - graph.axis(1).Minimum) / 1000;
    return axisNumber(plot.x[i], graph.axis(1).Format, step) + "   " + trimmed(plot.time) + "   " +
           axisNumber(plot.level[i], levelFormat(graph), 0.1);
}

}  // namespace zel
