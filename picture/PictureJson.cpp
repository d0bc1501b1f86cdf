#include "picture/PictureJson.h"

#include <cstdint>

#include "forms/WaterfallForm.h"
#include "picture/AnnotationFields.h"
#include "platform/Graph.h"
#include "platform/Graph3D.h"
#include "support/JsonWriter.h"
#include "trace/ViewAnnotations.h"
#include "waterfall/SweepHistory.h"
#include "waterfall/WaterfallPicture.h"

namespace zel {
namespace {

constexpr int kAxes = 3;

JsonWriter begun(const char* kind) {
    JsonWriter json;
    json.beginObject().member("zeldraw", kPictureVersion).member("kind", kind);
    return json;
}

void writeAxis(JsonWriter& json, const GraphAxis& axis) {
    json.beginObject().member("min", axis.Minimum).member("max", axis.Maximum);
    json.member("labels", axis.ShowLabels).member("format", axis.Format);
    json.member("label_color", static_cast<double>(axis.LabelColor)).endObject();
}

void writeAnnotations(JsonWriter& json, const ViewAnnotations& view) {
    json.name("annotations").beginObject();
    const auto write = [&json](const char* name, const auto& value) { json.member(name, value); };
    forEachAnnotationFlag(view, write);
    forEachAnnotationText(view, write);
    json.endObject();
}

void writeView(JsonWriter& json, const GraphView3D& view) {
    json.beginObject().member("latitude", view.Latitude).member("longitude", view.Longitude);
    json.member("distance", view.Distance).name("translation");
    json.values(std::initializer_list<double>{view.TransX, view.TransY, view.TransZ}).endObject();
}

void writeAxes(JsonWriter& json, const Graph3D& graph) {
    json.name("axes").beginList();
    for (int axis = 1; axis <= kAxes; ++axis) writeAxis(json, graph.axis(axis));
    json.endList();
}

void writeColourBar(JsonWriter& json, const WaterfallForm& form) {
    json.name("bar").beginObject();
    json.member("high", form.lblMAX.Caption.get()).member("low", form.lblMin.Caption.get());
    json.endObject();
}

void writePlots(JsonWriter& json, const Graph3D& graph) {
    json.name("plots").beginList();
    for (const GraphCurve3D& plot : graph.plots()) {
        json.beginObject().member("row", plot.row).member("time", plot.time);
        json.member("line", plot.lineVisible).member("fill", plot.fillStyle);
        json.member("map", plot.colorMapStyle);
        json.name("depth").values(plot.depth).name("x").values(plot.x);
        json.name("level").values(plot.level).name("colour").values(plot.colour).endObject();
    }
    json.endList();
}

/// The labels of the depth axis.
void writeRowLabels(JsonWriter& json, const ValuePairs& labels) {
    json.name("row_labels").beginList();
    for (int row = labels.first(); row <= labels.count(); ++row) {
        const ValuePair& label = labels.item(row);
        if (label.Name.empty()) continue;
        json.beginObject().member("row", row).member("text", label.Name);
        json.member("value", label.Value).endObject();
    }
    json.endList().member("row_label_count", labels.count());
}

void writeMarkers(JsonWriter& json, const Graph3D& graph) {
    json.name("markers").beginList();
    for (const GraphCursor3D& marker : graph.cursors()) {
        json.beginObject().member("x", marker.X).member("depth", marker.Y);
        json.member("level", marker.Z).member("row", marker.row).member("placed", marker.placed);
        json.member("text", marker.Name).member("text_visible", marker.NameVisible);
        json.endObject();
    }
    json.endList();
}

void writeStyle(JsonWriter& json, const PictureStyle& style) {
    json.name("style").beginObject().member("map", style.colourMap);
    json.member("depth_rows", style.depthRows).member("levels", static_cast<int>(style.levels));
    json.member("low", style.low).member("high", style.high);
    if (style.view) {
        json.name("view");
        writeView(json, *style.view);
    }
    json.endObject();
}

}  // namespace

std::string graphJson(const Graph& graph, const ViewAnnotations& view) {
    JsonWriter json = begun("graph");
    json.name("x");
    writeAxis(json, graph.xAxis());
    json.name("y");
    writeAxis(json, graph.yAxis());
    json.member("first_x", graph.firstX()).member("increment", graph.increment());
    json.name("values").values(graph.values());
    json.name("cursors").beginList();
    for (int i = 1; i <= graph.cursorCount(); ++i) {
        const GraphCursor& cursor = graph.cursor(i);
        json.beginObject().member("x", cursor.X).member("y", cursor.Y);
        json.member("color", static_cast<double>(cursor.color)).member("visible", cursor.Visible);
        json.endObject();
    }
    json.endList().name("trigger").beginObject();
    json.member("caption", graph.trigger().Caption).member("height", graph.trigger().Height);
    json.member("visible", graph.trigger().Visible).endObject();
    json.member("note", graph.Note.get()).member("incomplete", graph.Incomplete.get());
    json.member("old", graph.Old.get());
    writeAnnotations(json, view);
    return json.endObject().text();
}

std::string waterfallJson(const WaterfallForm& form, const PictureStyle& style) {
    const Graph3D& graph = form.Graph3D;
    JsonWriter json = begun("waterfall");
    writeAxes(json, graph);
    json.member("level_ticks", graph.LevelTicks.get()).member("level_grid", graph.LevelGrid.get());
    json.member("back_color", static_cast<double>(graph.BackColor.get()));
    json.member("projection", static_cast<int>(graph.Projection.get()));
    json.member("perspective", graph.PerspectiveFactor.get()).name("view");
    writeView(json, graph.view());
    writePlots(json, graph);
    writeRowLabels(json, graph.valuePairs(2));
    writeMarkers(json, graph);
    writeColourBar(json, form);
    writeStyle(json, style);
    return json.endObject().text();
}

std::string spectrogramJson(const WaterfallForm& form, const SweepHistory& history) {
    JsonWriter json = begun("spectrogram");
    writeAxes(json, form.Graph3D);
    writeColourBar(json, form);
    json.name("rows").beginList();
    for (int back = history.count() - 1; back >= 0; --back) {
        const HistoryRow& row = history.row(back);
        json.beginObject().member("time", row.time).member("first_x", row.firstX);
        json.member("increment", row.increment).member("pairs", row.pairs);
        json.member("low", row.low()).member("step", row.step());
        json.name("codes").beginList();
        for (const std::uint16_t code : row.codes()) json.value(static_cast<int>(code));
        json.endList().endObject();
    }
    return json.endList().endObject().text();
}

}  // namespace zel
