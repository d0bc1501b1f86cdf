#include "tests/house/House.h"

#include <algorithm>
#include <map>
#include <optional>
#include <set>
#include <sstream>
#include <stdexcept>

namespace zel::house {
namespace {

using Row = std::vector<std::string>;  ///< the cells of a table's row
using Arrows = std::map<std::string, std::set<std::string>>;

/// The words of a cell that stand in backticks.
std::vector<std::string> namesIn(const std::string& cell) {
    std::vector<std::string> names;
    for (std::size_t open = cell.find('`'); open != std::string::npos;) {
        const std::size_t close = cell.find('`', open + 1);
        if (close == std::string::npos) break;
        names.push_back(cell.substr(open + 1, close - open - 1));
        open = cell.find('`', close + 1);
    }
    return names;
}

/// The rows of the first table below a heading, without the two that make its head.
std::vector<Row> tableBelow(const std::string& markdown, const std::string& heading) {
    std::istringstream stream(markdown);
    std::vector<Row> rows;
    bool below = false;
    for (std::string line; std::getline(stream, line);) {
        if (startsWith(line, "#")) below = line.substr(line.find_first_not_of("# ")) == heading;
        if (!below || !startsWith(line, "|")) continue;
        Row row;
        std::istringstream cells(line.substr(1));
        for (std::string cell; std::getline(cells, cell, '|');) row.push_back(cell);
        rows.push_back(row);
    }
    if (rows.size() < 2) throw std::runtime_error("no table below \"" + heading + "\"");
    rows.erase(rows.begin(), rows.begin() + 2);
    return rows;
}

const Room* roomNamed(const std::vector<Room>& rooms, std::string_view name) {
    const auto at = std::find_if(rooms.begin(), rooms.end(),
                                 [&](const Room& room) { return room.name == name; });
    return at == rooms.end() ? nullptr : &*at;
}

bool mayInclude(const Room& from, const Room& to) {
    return from.name == to.name || from.mayIncludeAll ||
           std::find(from.mayInclude.begin(), from.mayInclude.end(), to.name) !=
               from.mayInclude.end();
}

/// Calls `visit(file, included, from, to)` for each include that has a room at both ends.
template <typename Visit>
void forEachArrow(const House& house, const std::vector<SourceFile>& files, Visit visit) {
    for (const SourceFile& file : files) {
        const Room* from = house.roomOf(file.path);
        for (const std::string& included : includes(file, IncludeKind::Quoted)) {
            const Room* to = house.roomOf(included);
            if (from != nullptr && to != nullptr) visit(file.path, included, *from, *to);
        }
    }
}

/// The way from `room` back to a room that is on the way, if there is one.
std::optional<std::string> findCircle(const Arrows& arrows, const std::string& room,
                                      std::vector<std::string>& way, std::set<std::string>& done) {
    const auto met = std::find(way.begin(), way.end(), room);
    if (met != way.end()) {
        std::string circle;
        for (auto at = met; at != way.end(); ++at) circle += *at + " -> ";
        return circle + room;
    }
    if (!done.insert(room).second) return std::nullopt;
    way.push_back(room);
    if (const auto from = arrows.find(room); from != arrows.end()) {
        for (const std::string& to : from->second) {
            if (auto circle = findCircle(arrows, to, way, done)) return circle;
        }
    }
    way.pop_back();
    return std::nullopt;
}

std::vector<std::string> circlesIn(const Arrows& arrows) {
    std::vector<std::string> circles;
    std::set<std::string> done;
    for (const auto& [room, to] : arrows) {
        std::vector<std::string> way;
        if (auto circle = findCircle(arrows, room, way, done)) circles.push_back(*circle);
    }
    return circles;
}

bool beginsWithOneOf(std::string_view path, const std::vector<std::string>& places) {
    return std::any_of(places.begin(), places.end(),
                       [&](const std::string& place) { return startsWith(path, place); });
}

/// The paths in the first column of the table below a heading.
std::vector<std::string> placesBelow(const std::string& markdown, const std::string& heading) {
    std::vector<std::string> places;
    for (const Row& row : tableBelow(markdown, heading))
        for (const std::string& place : namesIn(row.at(0))) places.push_back(place);
    return places;
}

}  // namespace

const Room* House::roomOf(std::string_view path) const {
    const Room* best = nullptr;
    for (const Room& room : rooms) {
        const bool above = startsWith(path, room.name + "/");
        if (above && (best == nullptr || room.name.size() > best->name.size())) best = &room;
    }
    return best;
}

bool House::isSystemPlace(std::string_view path) const {
    return beginsWithOneOf(path, systemPlaces);
}

bool House::isLocalePlace(std::string_view path) const {
    return beginsWithOneOf(path, localePlaces);
}

House readHouse(const std::string& markdown) {
    House house;
    for (const Row& row : tableBelow(markdown, "Allowed arrows")) {
        const std::vector<std::string> name = namesIn(row.at(0));
        if (name.size() != 1) throw std::runtime_error("a row of the arrows names no room");
        house.rooms.push_back({name[0], namesIn(row.at(1)),
                               row.at(1).find("everything") != std::string::npos,
                               row.at(2).find("yes") != std::string::npos,
                               row.at(0).find("(coming)") != std::string::npos});
    }
    for (const Room& room : house.rooms) {
        for (const std::string& other : room.mayInclude) {
            if (roomNamed(house.rooms, other) != nullptr) continue;
            throw std::runtime_error(room.name + " may include " + other + ", which is no room");
        }
    }
    for (const Row& row : tableBelow(markdown, "Exceptions")) {
        const std::vector<std::string> from = namesIn(row.at(0));
        const std::vector<std::string> to = namesIn(row.at(1));
        if (from.size() == 1 && to.size() == 1) house.exceptions.push_back({from[0], to[0]});
    }
    house.systemPlaces = placesBelow(markdown, "The system and its clock");
    house.localePlaces = placesBelow(markdown, "The language of the user");
    return house;
}

std::vector<std::string> homelessFiles(const House& house, const std::vector<SourceFile>& files) {
    std::vector<std::string> breaches;
    for (const SourceFile& file : files) {
        if (house.roomOf(file.path) == nullptr) breaches.push_back(file.path);
    }
    return breaches;
}

std::vector<std::string> missingRooms(const House& house, const std::vector<SourceFile>& files) {
    std::set<std::string> standing;
    for (const SourceFile& file : files) {
        if (const Room* room = house.roomOf(file.path)) standing.insert(room->name);
    }
    std::vector<std::string> breaches;
    for (const Room& room : house.rooms) {
        const bool stands = standing.count(room.name) != 0;
        if (!stands && !room.coming) breaches.push_back(room.name + " has no file");
        if (stands && room.coming) breaches.push_back(room.name + " is not coming, it is there");
    }
    return breaches;
}

std::vector<std::string> unmirroredRooms(const House& house, const std::vector<SourceFile>& files) {
    const std::string tests = "tests/";
    std::set<std::string> mirrored;
    for (const SourceFile& file : files) {
        if (!startsWith(file.path, tests)) continue;
        const std::size_t end = file.path.rfind('/');
        if (end >= tests.size())
            mirrored.insert(file.path.substr(tests.size(), end - tests.size()));
    }
    std::vector<std::string> breaches;
    for (const std::string& folder : mirrored) {
        if (folder != "house" && roomNamed(house.rooms, folder) == nullptr)
            breaches.push_back(tests + folder + " mirrors no room");
    }
    for (const Room& room : house.rooms) {
        const bool tested = mirrored.count(room.name) != 0;
        if (!tested && !room.coming && !room.mayIncludeAll)
            breaches.push_back(tests + room.name + " is missing");
    }
    return breaches;
}

std::vector<std::string> unknownIncludes(const std::vector<SourceFile>& files) {
    std::set<std::string> paths;
    for (const SourceFile& file : files) paths.insert(file.path);
    std::vector<std::string> breaches;
    for (const SourceFile& file : files) {
        for (const std::string& included : includes(file, IncludeKind::Quoted)) {
            const bool made = included.size() > 4 && included.substr(included.size() - 4) == ".moc";
            if (!made && paths.count(included) == 0) {
                breaches.push_back(file.path + " includes \"" + included + "\"");
            }
        }
    }
    return breaches;
}

std::vector<std::string> forbiddenArrows(const House& house, const std::vector<SourceFile>& files) {
    std::vector<std::string> breaches;
    forEachArrow(house, files,
                 [&](const std::string& file, const std::string& included, const Room& from,
                     const Room& to) {
                     const bool excepted = std::any_of(
                         house.exceptions.begin(), house.exceptions.end(),
                         [&](const ArrowException& exception) {
                             return exception.file == file && exception.included == included;
                         });
                     if (!mayInclude(from, to) && !excepted) {
                         breaches.push_back(file + " includes \"" + included + "\": " + from.name +
                                            " may not include " + to.name);
                     }
                 });
    return breaches;
}

std::vector<std::string> idleExceptions(const House& house, const std::vector<SourceFile>& files) {
    std::vector<std::string> breaches;
    for (const ArrowException& exception : house.exceptions) {
        bool needed = false;
        forEachArrow(house, files,
                     [&](const std::string& file, const std::string& included, const Room& from,
                         const Room& to) {
                         needed =
                             needed || (exception.file == file && exception.included == included &&
                                        !mayInclude(from, to));
                     });
        if (!needed) breaches.push_back(exception.file + " -> " + exception.included);
    }
    return breaches;
}

std::vector<std::string> circlesOfIncludes(const House& house,
                                           const std::vector<SourceFile>& files) {
    Arrows arrows;
    forEachArrow(house, files,
                 [&](const std::string&, const std::string&, const Room& from, const Room& to) {
                     if (from.name != to.name) arrows[from.name].insert(to.name);
                 });
    return circlesIn(arrows);
}

std::vector<std::string> circlesOfTable(const House& house) {
    Arrows arrows;
    for (const Room& room : house.rooms) {
        arrows[room.name].insert(room.mayInclude.begin(), room.mayInclude.end());
    }
    return circlesIn(arrows);
}

std::vector<std::string> pictureBreaches(const House& house, const std::string& svg) {
    const std::string open = "<title>";
    const std::string arrow = "&#45;&gt;";
    Arrows drawn;
    for (std::size_t at = svg.find(open); at != std::string::npos; at = svg.find(open, at + 1)) {
        const std::size_t end = svg.find("</title>", at);
        if (end == std::string::npos) break;
        const std::string title = svg.substr(at + open.size(), end - at - open.size());
        const std::size_t middle = title.find(arrow);
        if (middle == std::string::npos) continue;
        drawn[title.substr(0, middle)].insert(title.substr(middle + arrow.size()));
    }
    std::vector<std::string> breaches;
    for (const auto& [from, targets] : drawn) {
        const Room* room = roomNamed(house.rooms, from);
        for (const std::string& target : targets) {
            const Room* other = roomNamed(house.rooms, target);
            if (!room || !other || room->mayIncludeAll || !mayInclude(*room, *other))
                breaches.push_back(from + " -> " + target + " is not in the table");
        }
    }
    for (const Room& room : house.rooms) {
        if (room.mayIncludeAll) continue;
        std::set<std::string> reached;
        std::vector<std::string> next{room.name};
        while (!next.empty()) {
            const std::string from = next.back();
            next.pop_back();
            for (const std::string& target : drawn[from])
                if (reached.insert(target).second) next.push_back(target);
        }
        for (const std::string& target : room.mayInclude)
            if (!reached.contains(target))
                breaches.push_back(room.name + " -> " + target + " is not in the picture");
    }
    return breaches;
}

std::vector<std::string> longFiles(const std::vector<SourceFile>& files, std::size_t limit) {
    std::vector<std::string> breaches;
    for (const SourceFile& file : files) {
        const auto lines =
            static_cast<std::size_t>(std::count(file.text.begin(), file.text.end(), '\n'));
        if (lines > limit) breaches.push_back(file.path + ": " + std::to_string(lines) + " lines");
    }
    return breaches;
}

}  // namespace zel::house
