#include "drawing/PictureReader.h"

#include <QJsonDocument>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <string>
#include <utility>
#include <vector>

#include "drawing/JsonReader.h"
#include "forms/WaterfallForm.h"
#include "picture/AnnotationFields.h"
#include "picture/PictureJson.h"
#include "platform/Form.h"
#include "platform/Graph.h"
#include "platform/Graph3D.h"
#include "trace/ViewAnnotations.h"
#include "waterfall/SweepHistory.h"
#include "waterfall/WaterfallPicture.h"

namespace zel {
namespace {

constexpr int kHighestCode = 65535;

Color colorOf(const JsonReader& json, const char* name, Color initial) {
    double number = initial;
    json.take(name, number);
    if (number >= 0 && number <= 0xFFFFFFFF) return static_cast<Color>(number);
    json.complain(name, "is no colour");
    return initial;
}

GraphAxis axisOf(const JsonReader& json) {
    GraphAxis axis;
    json.take("min", axis.Minimum);
    json.take("max", axis.Maximum);
    json.take("labels", axis.ShowLabels);
    json.take("format", axis.Format);
    axis.LabelColor = colorOf(json, "label_color", axis.LabelColor);
    return axis;
}

ViewAnnotations annotationsOf(const JsonReader& json) {
    ViewAnnotations view;
    const auto read = [&json](const char* name, auto& value) { json.take(name, value); };
    forEachAnnotationFlag(view, read);
    forEachAnnotationText(view, read);
    return view;
}

void readGraph(const JsonReader& json, DrawnPicture& picture) {
    Graph& graph = picture.forms.controller.CWGraph1;
    json.object("x", [&](const JsonReader& axis) {
        const GraphAxis x = axisOf(axis);
        graph.setXRange(x.Minimum, x.Maximum);
    });
    json.object("y", [&](const JsonReader& axis) {
        const GraphAxis y = axisOf(axis);
        graph.setYRange(y.Minimum, y.Maximum);
        graph.showYLabels(y.ShowLabels);
    });
    std::vector<double> values;
    double firstX = 0;
    double increment = 0;
    json.take("values", values);
    json.take("first_x", firstX);
    json.take("increment", increment);
    graph.removeCursors();
    json.list("cursors", [&](const JsonReader& row) {
        GraphCursor cursor;
        row.take("x", cursor.X);
        row.take("y", cursor.Y);
        cursor.color = colorOf(row, "color", cursor.color);
        row.take("visible", cursor.Visible);
        graph.addCursor(cursor);
    });
    json.object("trigger", [&](const JsonReader& row) {
        GraphAnnotation trigger;
        row.take("caption", trigger.Caption);
        row.take("height", trigger.Height);
        row.take("visible", trigger.Visible);
        graph.setTrigger(trigger);
    });
    graph.plotY(values, firstX, increment);
    // The plot takes notes away, so they come after it.
    std::string note;
    std::string incomplete;
    bool old = false;
    json.take("note", note);
    json.take("incomplete", incomplete);
    json.take("old", old);
    graph.Note = note;
    graph.Incomplete = incomplete;
    graph.Old = old;
    json.object("annotations",
                [&](const JsonReader& texts) { picture.annotations = annotationsOf(texts); });
}

void readAxes(const JsonReader& json, Graph3D& graph) {
    int number = 0;
    json.list("axes", [&](const JsonReader& row) {
        if (++number > 3) return json.complain("axes", "are more than three");
        const GraphAxis axis = axisOf(row);
        graph.setRange(number, axis.Minimum, axis.Maximum);
        graph.setFormat(number, axis.Format);
        graph.setLabelColor(number, axis.LabelColor);
    });
}

void readColourBar(const JsonReader& json, WaterfallForm& form) {
    json.object("bar", [&](const JsonReader& bar) {
        std::string high;
        std::string low;
        bar.take("high", high);
        bar.take("low", low);
        form.lblMAX.Caption = high;
        form.lblMin.Caption = low;
    });
}

GraphView3D viewOf(const JsonReader& json) {
    GraphView3D view;
    json.take("latitude", view.Latitude);
    json.take("longitude", view.Longitude);
    json.take("distance", view.Distance);
    std::vector<double> translation{view.TransX, view.TransY, view.TransZ};
    json.take("translation", translation);
    if (translation.size() != 3) {
        json.complain("translation", "has not three numbers");
        return view;
    }
    view.TransX = translation[0];
    view.TransY = translation[1];
    view.TransZ = translation[2];
    return view;
}

void readPlots(const JsonReader& json, Graph3D& graph) {
    graph.plots().clear();
    json.list("plots", [&](const JsonReader& row) {
        GraphCurve3D plot;
        row.take("row", plot.row);
        row.take("time", plot.time);
        row.take("line", plot.lineVisible);
        row.take("fill", plot.fillStyle);
        row.take("map", plot.colorMapStyle);
        row.take("depth", plot.depth);
        row.take("x", plot.x);
        row.take("level", plot.level);
        row.take("colour", plot.colour);
        const std::size_t size = plot.level.size();
        if (plot.depth.size() != size || plot.x.size() != size || plot.colour.size() != size)
            return row.complain("level", "has another length than depth, x or colour");
        graph.plots().push_back(std::move(plot));
    });
    graph.noteRows();
}

void readRowLabels(const JsonReader& json, Graph3D& graph) {
    json.list("row_labels", [&](const JsonReader& row) {
        int number = 0;
        ValuePair label;
        row.take("row", number);
        row.take("text", label.Name);
        row.take("value", label.Value);
        if (number < 1) return row.complain("row", "is not 1 or more");
        graph.setValuePair(2, number, label);
    });
}

void readMarkers(const JsonReader& json, Graph3D& graph) {
    json.list("markers", [&](const JsonReader& row) {
        GraphCursor3D marker;
        row.take("x", marker.X);
        row.take("depth", marker.Y);
        row.take("level", marker.Z);
        row.take("row", marker.row);
        row.take("placed", marker.placed);
        row.take("text", marker.Name);
        row.take("text_visible", marker.NameVisible);
        graph.addCursor();
        if (!graph.cursors().empty()) graph.setCursor(graph.cursors().size() - 1, marker);
    });
}

void readStyle(const JsonReader& json, PictureStyle& style) {
    json.object("style", [&](const JsonReader& row) {
        int levels = 0;
        row.take("map", style.colourMap);
        row.take("depth_rows", style.depthRows);
        row.take("levels", levels);
        if (levels < 0 || levels > static_cast<int>(LevelSource::ByHand))
            return row.complain("levels", "is not 0 to 2");
        style.levels = static_cast<LevelSource>(levels);
        row.take("low", style.low);
        row.take("high", style.high);
        row.object("view", [&](const JsonReader& view) { style.view = viewOf(view); });
    });
}

void readWaterfall(const JsonReader& json, DrawnPicture& picture) {
    WaterfallForm& form = picture.forms.waterfall;
    Graph3D& graph = form.Graph3D;
    readAxes(json, graph);
    bool ticks = graph.LevelTicks;
    bool grid = graph.LevelGrid;
    int projection = 0;
    double perspective = graph.PerspectiveFactor;
    json.take("level_ticks", ticks);
    json.take("level_grid", grid);
    json.take("projection", projection);
    json.take("perspective", perspective);
    if (projection < 0 || projection > 1) json.complain("projection", "is not 0 or 1");
    graph.LevelTicks = ticks;
    graph.LevelGrid = grid;
    graph.BackColor = colorOf(json, "back_color", graph.BackColor);
    graph.Projection = static_cast<Projection3D>(projection == 1);
    graph.PerspectiveFactor = perspective;
    json.object("view", [&](const JsonReader& view) { graph.setView(viewOf(view)); });
    readPlots(json, graph);
    readRowLabels(json, graph);
    readMarkers(json, graph);
    readColourBar(json, form);
    readStyle(json, picture.style);
}

void readSpectrogram(const JsonReader& json, DrawnPicture& picture) {
    readAxes(json, picture.forms.waterfall.Graph3D);
    readColourBar(json, picture.forms.waterfall);
    json.list("rows", [&](const JsonReader& row) {
        double low = 0;
        double step = 0;
        std::vector<double> numbers;
        row.take("low", low);
        row.take("step", step);
        row.take("codes", numbers);
        std::vector<std::uint16_t> codes;
        codes.reserve(numbers.size());
        for (const double number : numbers) {
            if (!(number >= 0 && number <= kHighestCode) || number != std::floor(number))
                return row.complain("codes", "holds what is no whole number from 0 to 65535");
            codes.push_back(static_cast<std::uint16_t>(number));
        }
        HistoryRow sweep(std::move(codes), low, step);
        row.take("time", sweep.time);
        row.take("first_x", sweep.firstX);
        row.take("increment", sweep.increment);
        row.take("pairs", sweep.pairs);
        picture.history.add(std::move(sweep));
    });
}

struct KindRow {
    const char* name;
    DrawnKind kind;
    void (*read)(const JsonReader& json, DrawnPicture& picture);
};
constexpr KindRow kKinds[] = {
    {"graph", DrawnKind::Graph, readGraph},
    {"waterfall", DrawnKind::Waterfall, readWaterfall},
    {"spectrogram", DrawnKind::Spectrogram, readSpectrogram},
};

}  // namespace

QString readPicture(const QByteArray& bytes, DrawnPicture& picture) {
    QJsonParseError error;
    const QJsonDocument document = QJsonDocument::fromJson(bytes, &error);
    if (!document.isObject()) {
        const QString why = error.error == QJsonParseError::NoError
                                ? QString("it is no object")
                                : error.errorString() + QString(" at byte %1").arg(error.offset);
        return "the data is not the JSON of a picture: " + why;
    }
    QString problem;
    const JsonReader json(document.object(), "", problem);
    int version = 0;
    std::string name;
    json.take("zeldraw", version);
    json.take("kind", name);
    if (!problem.isEmpty()) return problem;
    if (version != kPictureVersion)
        return QString("the data is of version %1, this program knows version %2")
            .arg(version)
            .arg(kPictureVersion);
    for (const KindRow& row : kKinds) {
        if (name != row.name) continue;
        picture.kind = row.kind;
        row.read(json, picture);
        return problem;
    }
    return "kind: is not graph, waterfall or spectrogram";
}

}  // namespace zel
