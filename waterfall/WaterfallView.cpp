#include "waterfall/WaterfallView.h"

#include <cstddef>
#include <string>

#include "forms/Forms.h"
#include "platform/Controls.h"
#include "platform/Files.h"
#include "platform/Form.h"
#include "platform/Graph3D.h"
#include "platform/Services.h"
#include "waterfall/Graph3dOps.h"

namespace zel {
namespace {

constexpr Color kHiddenKey = 0xE0E0E0;
constexpr Color kShownKey = 0x80FF80;
constexpr Color kWhite = 0xFFFFFF;
constexpr double kOrthographicNearer = 1.8;
constexpr double kLatitude = 58;
constexpr double kLongitude = -325;
constexpr int kDepthAxis = 2;
constexpr int kPointStyle = 6;
constexpr const char* kNoTime = "     ";
constexpr double kAxisMaxima[] = {12, 10, 10};

}  // namespace

WaterfallView::WaterfallView(Forms& forms, Graph3dOps& ops, ApplicationFolder& folder,
                             FileService& files)
    : form_(forms.waterfall),
      panel_(forms.controller),
      ops_(ops),
      settings_(forms.waterfall, folder, files) {
    handlers_.on(form_.Load, [this] { Form_Load(); });
    handlers_.on(form_.Unload, [this](int /*argument*/) { Form_Unload(); });
    handlers_.on(form_.QueryUnload, [this](int& cancel) {
        // The frame's cross hides the window as the key does; its rows stay.
        cancel = -1;
        if (form_.Visible) cmd3D_Click();
    });
    handlers_.on(panel_.cmd3D.Clicked, [this] { cmd3D_Click(); });

    struct Entry {
        MenuItem& item;
        void (WaterfallView::*handler)();
    };
    const Entry entries[] = {
        {form_.ViewPerspective, &WaterfallView::ViewPerspective_Click},
        {form_.ViewOrthographic, &WaterfallView::ViewOrthographic_Click},
        {form_.ViewWaterfall, &WaterfallView::ViewWaterfall_Click},
        {form_.ViewSpectrogram, &WaterfallView::ViewSpectrogram_Click},
        {form_.VewClear, &WaterfallView::VewClear_Click},
        {form_.ViewReset, &WaterfallView::ViewReset_Click},
        {form_.ActionMove, &WaterfallView::ActionMove_Click},
        {form_.ActionMarkers, &WaterfallView::ActionMarkers_Click},
        {form_.MarkersDelete, &WaterfallView::MarkersDelete_Click},
    };
    for (const Entry& entry : entries)
        handlers_.on(entry.item.Clicked, [this, handler = entry.handler] { (this->*handler)(); });

    zel::Graph3D& graph = form_.Graph3D;
    handlers_.on(graph.Clicked, [this, &graph] {
        if (form_.ActionMarkers.Checked) graph.addCursor();
    });
    handlers_.on(graph.CursorPlaced, [this](int plot, int point) { place(plot, point); });
    handlers_.on(graph.RotationEnded, [this, &graph] {
        GraphView3D& set = form_.IsSpectrogram ? form_.SpectrogramView : form_.WaterfallView;
        set.Latitude = graph.view().Latitude;
        set.Longitude = graph.view().Longitude;
        (form_.IsSpectrogram ? form_.spectrogramRotated : form_.waterfallRotated) = true;
    });
    handlers_.on(graph.ZoomEnded, [this, &graph] {
        (form_.IsSpectrogram ? form_.SpectrogramView : form_.WaterfallView).Distance =
            graph.view().Distance;
        (form_.IsSpectrogram ? form_.spectrogramZoomed : form_.waterfallZoomed) = true;
    });
    handlers_.on(graph.TranslationEnded, [this, &graph] {
        GraphView3D& set = form_.IsSpectrogram ? form_.SpectrogramView : form_.WaterfallView;
        set.TransX = graph.view().TransX;
        set.TransY = graph.view().TransY;
        set.TransZ = graph.view().TransZ;
        (form_.IsSpectrogram ? form_.spectrogramPanned : form_.waterfallPanned) = true;
    });
}

void WaterfallView::Form_Load() {
    loading_ = true;
    zel::Graph3D& graph = form_.Graph3D;
    settings_.readAxes();
    settings_.readCameras();
    if (settings_.readMode()) {
        graph.setView(form_.SpectrogramView);
        ViewSpectrogram_Click();
    } else {
        graph.setView(form_.WaterfallView);
        ViewWaterfall_Click();
    }
    GraphView3D view = graph.view();
    view.Distance = settings_.readDistance(view.Distance);
    graph.setView(view);
    ops_.saveGraphView(graph, false);
    loading_ = false;
}

void WaterfallView::Form_Unload() {
    if (form_.loaded()) settings_.write();
}

void WaterfallView::cmd3D_Click() {
    if (form_.Visible) {
        form_.Hide();
        panel_.cmd3D.BackColor = kHiddenKey;
    } else {
        form_.Show();
        panel_.cmd3D.BackColor = kShownKey;
    }
}

void WaterfallView::setProjection(bool isOrthographic) {
    zel::Graph3D& graph = form_.Graph3D;
    const bool changes = form_.ViewOrthographic.Checked != isOrthographic;
    form_.ViewOrthographic.Checked = isOrthographic;
    form_.ViewPerspective.Checked = !isOrthographic;
    if (isOrthographic && changes && !loading_) {
        GraphView3D view = graph.view();
        view.Distance -= kOrthographicNearer;
        graph.setView(view);
    }
    ops_.setProjection(graph, isOrthographic);
}

void WaterfallView::ViewPerspective_Click() {
    if (!form_.ViewPerspective.Checked) setProjection(false);
}

void WaterfallView::ViewOrthographic_Click() {
    if (!form_.ViewOrthographic.Checked) setProjection(true);
}

void WaterfallView::takeMoved(const GraphView3D& set, bool& rotated, bool& zoomed, bool& panned) {
    GraphView3D view = form_.Graph3D.view();
    if (rotated) {
        view.Latitude = set.Latitude;
        view.Longitude = set.Longitude;
    }
    if (zoomed) view.Distance = set.Distance;
    if (panned) {
        view.TransX = set.TransX;
        view.TransY = set.TransY;
        view.TransZ = set.TransZ;
    }
    rotated = zoomed = panned = true;
    form_.Graph3D.setView(view);
}

void WaterfallView::styleRows(int map) {
    for (GraphCurve3D& plot : form_.Graph3D.plots()) plot.colorMapStyle = map;
    form_.Graph3D.noteRows();
}

void WaterfallView::ViewWaterfall_Click() {
    form_.ViewWaterfall.Checked = true;
    form_.ViewSpectrogram.Checked = false;
    form_.IsSpectrogram = false;
    setProjection(false);
    takeMoved(form_.WaterfallView, form_.waterfallRotated, form_.waterfallZoomed,
              form_.waterfallPanned);
    form_.WaterfallView = form_.Graph3D.view();
    GraphView3D view = form_.Graph3D.view();
    view.Latitude = kLatitude;
    view.Longitude = kLongitude;
    form_.Graph3D.setView(view);
    styleRows(Graph3dOps::kWaterfallMap);
    form_.Graph3D.LevelTicks = true;
    form_.Graph3D.LevelGrid = true;
}

void WaterfallView::ViewSpectrogram_Click() {
    form_.ViewSpectrogram.Checked = true;
    form_.ViewWaterfall.Checked = false;
    form_.IsSpectrogram = true;
    setProjection(true);
    GraphView3D view = form_.Graph3D.view();
    view.Latitude = 0;
    view.Longitude = 0;
    form_.Graph3D.setView(view);
    form_.SpectrogramView.Latitude = 0;
    form_.SpectrogramView.Longitude = 0;
    takeMoved(form_.SpectrogramView, form_.spectrogramRotated, form_.spectrogramZoomed,
              form_.spectrogramPanned);
    form_.SpectrogramView = form_.Graph3D.view();
    styleRows(Graph3dOps::kSpectrogramMap);
    form_.waterfallPanned = false;
    form_.Graph3D.LevelTicks = false;
    form_.Graph3D.LevelGrid = false;
}

void WaterfallView::VewClear_Click() {
    ops_.clearGraph(form_.Graph3D);
    panel_.YVectorVal = 0;
}

void WaterfallView::ViewReset_Click() {
    zel::Graph3D& graph = form_.Graph3D;
    graph.setView({});
    form_.SpectrogramView = graph.view();
    form_.WaterfallView = graph.view();
    if (!graph.hasRows())
        for (int i = 1; i <= 3; ++i) graph.setRange(i, 0, kAxisMaxima[i - 1]);
    settings_.writeReset();
    form_.waterfallRotated = form_.spectrogramRotated = false;
    form_.waterfallPanned = form_.spectrogramPanned = false;
    form_.waterfallZoomed = form_.spectrogramZoomed = false;
}

void WaterfallView::ActionMove_Click() {
    if (form_.ActionMove.Checked) return;
    form_.ActionMove.Checked = true;
    form_.ActionMarkers.Checked = false;
    form_.Graph3D.removeLastCursor();
    form_.Graph3D.MouseMode = MouseMode3D::MoveView;
}

void WaterfallView::ActionMarkers_Click() {
    if (form_.ActionMarkers.Checked) return;
    form_.ActionMarkers.Checked = true;
    form_.ActionMove.Checked = false;
    form_.Graph3D.addCursor();
    form_.Graph3D.MouseMode = MouseMode3D::PlaceCursor;
}

void WaterfallView::MarkersDelete_Click() {
    form_.Graph3D.removeCursors();
    if (form_.ActionMarkers.Checked) form_.Graph3D.addCursor();
}

void WaterfallView::place(int plot, int point) {
    zel::Graph3D& graph = form_.Graph3D;
    if (graph.cursors().empty() || plot < 1 || plot > graph.plotCount() || point < 1) return;
    const GraphCurve3D& row = graph.plots()[static_cast<std::size_t>(plot - 1)];
    const auto i = static_cast<std::size_t>(point - 1);
    if (i >= row.level.size() || i >= row.x.size() || row.depth.empty()) return;
    GraphCursor3D cursor = graph.cursors().back();
    cursor.row = row.row;
    cursor.placed = true;
    graph.setCursor(graph.cursors().size() - 1, cursor);
    addCursor(row.x[i], row.depth[i < row.depth.size() ? i : 0], row.level[i]);
}

void WaterfallView::addCursor(double x, double y, double z) {
    zel::Graph3D& graph = form_.Graph3D;
    if (graph.cursors().empty()) return;
    const std::size_t last = graph.cursors().size() - 1;
    GraphCursor3D cursor = graph.cursors()[last];
    cursor.X = x;
    cursor.Y = y;
    cursor.Z = z;
    graph.setCursor(last, cursor);
    setTimeStamps(static_cast<int>(graph.cursors().size()), cursor.row - 1);
    cursor = graph.cursors()[last];
    cursor.PointColor = kWhite;
    cursor.CrosshairColor = kWhite;
    cursor.CrosshairStyle = 0;
    cursor.PointStyle = kPointStyle;
    graph.setCursor(last, cursor);
}

void WaterfallView::setTimeStamps(int count, int row) {
    zel::Graph3D& graph = form_.Graph3D;
    if (count <= 0 || graph.cursors().empty()) return;
    const std::size_t last = graph.cursors().size() - 1;
    GraphCursor3D cursor = graph.cursors()[last];
    const std::string& name = graph.valuePairs(kDepthAxis).item(row + 1).Name;
    cursor.Name = name.empty() || name == kNoTime ? form_.LastStampText : name;
    cursor.NameVisible = true;
    graph.setCursor(last, cursor);
}

}  // namespace zel
