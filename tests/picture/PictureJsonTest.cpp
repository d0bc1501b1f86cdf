#include <gtest/gtest.h>

#include <limits>

#include "forms/Forms.h"
#include "picture/PictureJson.h"

namespace zel {
namespace {

bool holds(const std::string& text, const std::string& part) {
    return text.find(part) != std::string::npos;
}

TEST(GraphJson, NamesItsVersionAndWhatIsOnTheGraph) {
    Forms forms;
    Graph& graph = forms.controller.CWGraph1;
    graph.setXRange(1e9, 2e9);
    graph.setYRange(-100, 0);
    graph.plotY({-50, std::numeric_limits<double>::quiet_NaN(), -60.25}, 1e9, 5e8);
    graph.removeCursors();
    graph.addCursor({1.5e9, -50, 0xFFFF00, true});
    graph.setTrigger({"Trigger", -42.5, true});
    graph.Incomplete = "INCOMPLETE 2/301";
    ViewAnnotations view;
    view.ok = true;
    view.refLevel = "Ref \"0\" dBm";
    view.xUnsure = true;
    const std::string json = graphJson(graph, view);
    for (const char* part : {R"({"zeldraw":1,"kind":"graph")", R"("x":{"min":1e+09,"max":2e+09)",
                             R"("y":{"min":-100,"max":0)", R"("first_x":1e+09,"increment":5e+08)",
                             R"("values":[-50,null,-60.25])",
                             R"("cursors":[{"x":1.5e+09,"y":-50,"color":16776960,"visible":true}])",
                             R"("trigger":{"caption":"Trigger","height":-42.5,"visible":true})",
                             R"("incomplete":"INCOMPLETE 2/301")", R"("ref_level":"Ref \"0\" dBm")",
                             R"("x_unsure":true)", R"("y_unsure":false)"})
        EXPECT_TRUE(holds(json, part)) << part << "\n" << json;
}

TEST(WaterfallJson, HoldsRowsLabelsMarkersAndTheView) {
    Forms forms;
    Graph3D& graph = forms.waterfall.Graph3D;
    graph.stampNext(7, "12:00:07");
    graph.plotCurve({3, 3}, {1, 2}, {-40, -50}, {10, 20});
    graph.setValuePair(2, 7, {"12:00:07", 3});
    forms.waterfall.lblMAX.Caption = "-20 dBm";
    PictureStyle style;
    style.levels = LevelSource::Rows;
    std::string json = waterfallJson(forms.waterfall, style);
    for (const char* part :
         {R"("kind":"waterfall")", R"("row":7,"time":"12:00:07")",
          R"("depth":[3,3],"x":[1,2],"level":[-40,-50],"colour":[10,20])",
          R"("row_labels":[{"row":7,"text":"12:00:07","value":3}])", R"("markers":[])",
          R"("bar":{"high":"-20 dBm")", R"("levels":1)", R"("latitude":58)"})
        EXPECT_TRUE(holds(json, part)) << part << "\n" << json;
    const std::string end = json.substr(json.find("\"style\""));
    EXPECT_FALSE(holds(end, "view"));
    style.view = GraphView3D();
    json = waterfallJson(forms.waterfall, style);
    EXPECT_TRUE(holds(json.substr(json.find("\"style\"")), R"("view":{"latitude":58)"));
}

TEST(SpectrogramJson, RowsStandOldestFirstAsSteps) {
    Forms forms;
    SweepHistory history(forms);
    for (const char* time : {"12:00:01", "12:00:02"}) {
        HistoryRow row({0, 65535}, -100, 0.5);
        row.time = time;
        history.add(std::move(row));
    }
    const std::string json = spectrogramJson(forms.waterfall, history);
    EXPECT_LT(json.find("12:00:01"), json.find("12:00:02"));
    EXPECT_TRUE(holds(json, R"("low":-100,"step":0.5,"codes":[0,65535])")) << json;
}

}  // namespace
}  // namespace zel
