#include "console/Graph3DCommands.h"

#include <cmath>
#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "platform/Graph.h"
#include "platform/Graph3D.h"
#include "support/NumberText.h"
#include "support/Text.h"

namespace zel {
namespace {

using Numbers = std::vector<double>;

/// False for a text that is not so many finite numbers.
bool parse(std::string_view text, std::size_t count, Numbers& numbers) {
    for (const std::string& word : split(text, ' ')) {
        if (word.empty()) continue;
        const std::optional<double> number = parseNumber(word);
        if (!number) return false;
        numbers.push_back(*number);
    }
    return numbers.size() == count;
}

std::string rotate(Graph3D& graph, const Numbers& numbers) {
    GraphView3D view = graph.view();
    view.Latitude = numbers[0];
    view.Longitude = numbers[1];
    graph.setView(view);
    graph.RotationEnded();
    return {};
}

std::string zoom(Graph3D& graph, const Numbers& numbers) {
    GraphView3D view = graph.view();
    view.Distance = numbers[0];
    graph.setView(view);
    graph.ZoomEnded();
    return {};
}

std::string pan(Graph3D& graph, const Numbers& numbers) {
    GraphView3D view = graph.view();
    view.TransX = numbers[0];
    view.TransY = numbers[1];
    view.TransZ = numbers[2];
    graph.setView(view);
    graph.TranslationEnded();
    return {};
}

std::string click(Graph3D& graph, const Numbers&) {
    graph.Clicked();
    return {};
}

std::string place(Graph3D& graph, const Numbers& numbers) {
    const auto inside = [](double number, std::size_t count) {
        return number == std::floor(number) && number >= 1 && number <= static_cast<double>(count);
    };
    if (!inside(numbers[0], graph.plots().size())) return "there is no such plot";
    const auto plot = static_cast<std::size_t>(numbers[0]);
    if (!inside(numbers[1], graph.plots()[plot - 1].level.size())) return "there is no such point";
    graph.CursorPlaced(static_cast<int>(numbers[0]), static_cast<int>(numbers[1]));
    return {};
}

std::string moveCursor(Graph& graph, const Numbers& numbers) {
    const bool there = numbers[0] == std::floor(numbers[0]) && numbers[0] >= 1 &&
                       numbers[0] <= graph.cursorCount();
    if (!there) return "there is no such cursor";
    if (!graph.cursor(static_cast<int>(numbers[0])).Visible) return "the cursor is not shown";
    graph.CursorMoved(static_cast<int>(numbers[0]), numbers[1], numbers[2]);
    return {};
}

std::string drawRectangle(Graph& graph, const Numbers& numbers) {
    if (!(numbers[1] > numbers[0]) || !(numbers[3] > numbers[2])) return "the rectangle is empty";
    graph.setXRange(numbers[0], numbers[1]);
    graph.setYRange(numbers[2], numbers[3]);
    graph.ZoomFinished();
    return {};
}

template <class G>
struct Command {
    std::string_view word;
    std::size_t count;
    const char* use;
    std::string (*run)(G& graph, const Numbers& numbers);
};
constexpr Command<Graph> kGraphCommands[] = {
    {"move2d", 3, "move2d takes INDEX X Y", moveCursor},
    {"zoom2d", 4, "zoom2d takes LEFT RIGHT BOTTOM TOP", drawRectangle},
};
constexpr Command<Graph3D> kCommands[] = {
    {"rotate3d", 2, "rotate3d takes LATITUDE LONGITUDE", rotate},
    {"zoom3d", 1, "zoom3d takes DISTANCE", zoom},
    {"pan3d", 3, "pan3d takes X Y Z", pan},
    {"click3d", 0, "click3d takes nothing", click},
    {"place3d", 2, "place3d takes PLOT POINT", place},
};

template <class G, std::size_t count>
bool run(const Command<G> (&commands)[count], G& graph, std::string_view word,
         std::string_view numbers, std::string& problem) {
    for (const Command<G>& command : commands) {
        if (command.word != word) continue;
        Numbers values;
        problem = parse(numbers, command.count, values) ? command.run(graph, values) : command.use;
        return true;
    }
    return false;
}

}  // namespace

bool runGraph3DCommand(Graph3D& graph, std::string_view word, std::string_view numbers,
                       std::string& problem) {
    return run(kCommands, graph, word, numbers, problem);
}

bool runGraphCommand(Graph& graph, std::string_view word, std::string_view numbers,
                     std::string& problem) {
    return run(kGraphCommands, graph, word, numbers, problem);
}

}  // namespace zel
