#pragma once
// The rules of the house as docs/architecture.md states them, and what breaks them.

#include <string>
#include <string_view>
#include <vector>

#include "tests/house/Sources.h"

namespace zel::house {

/// A row of the table of rooms.
struct Room {
    std::string name;                     ///< a folder relative to the root
    std::vector<std::string> mayInclude;  ///< names of other rooms
    bool mayIncludeAll = false;           ///< the row says "everything"
    bool standardOnly = false;            ///< standard C++ and nothing else
    bool coming = false;                  ///< the row says that it has no file yet
};

/// A row of the table of exceptions.
struct ArrowException {
    std::string file;
    std::string included;
};

struct House {
    std::vector<Room> rooms;
    std::vector<ArrowException> exceptions;
    std::vector<std::string> localePlaces;  ///< how the paths of files begin that may ask the
                                            ///< settings of the user's language
    std::vector<std::string> systemPlaces;  ///< how the paths of files begin that may use the
                                            ///< system and its clock

    /// The room with the longest name that is a folder above the path; null if there is none.
    const Room* roomOf(std::string_view path) const;
    bool isSystemPlace(std::string_view path) const;
    bool isLocalePlace(std::string_view path) const;
};

/// Reads the tables below the headings "Allowed arrows", "Exceptions", "The system and its clock"
/// and "The language of the user". Throws std::runtime_error when one of them has no table, or
/// names a room that is none.
House readHouse(const std::string& markdown);

/// Each of these gives one line a breach, empty when all is in order.

/// Files outside of all rooms.
std::vector<std::string> homelessFiles(const House& house, const std::vector<SourceFile>& files);
/// Rooms without a file that are not marked as coming, and rooms with files that are.
std::vector<std::string> missingRooms(const House& house, const std::vector<SourceFile>& files);
/// Rooms of the product without a folder below `tests`, and folders there that bear the name of no
/// room and are not `house`.
std::vector<std::string> unmirroredRooms(const House& house, const std::vector<SourceFile>& files);
/// Quoted includes that are no path of the tree from its root.
std::vector<std::string> unknownIncludes(const std::vector<SourceFile>& files);
/// Includes from a room into one that its row does not name, exceptions left out.
std::vector<std::string> forbiddenArrows(const House& house, const std::vector<SourceFile>& files);
/// Exceptions that no include needs.
std::vector<std::string> idleExceptions(const House& house, const std::vector<SourceFile>& files);
/// A circle of rooms that the includes make, as "a -> b -> a".
std::vector<std::string> circlesOfIncludes(const House& house,
                                           const std::vector<SourceFile>& files);
/// A circle of rooms that the table itself allows.
std::vector<std::string> circlesOfTable(const House& house);
/// Uses of real time outside of the places for it.
std::vector<std::string> realTimeUses(const House& house, const std::vector<SourceFile>& files);
/// Calls whose result depends on the language of the user, outside of the places for it and of the
/// tests.
std::vector<std::string> localeUses(const House& house, const std::vector<SourceFile>& files);
/// Headers that rooms of standard C++ include and that are none of the language's.
std::vector<std::string> foreignHeaders(const House& house, const std::vector<SourceFile>& files);
/// Arrows of the picture that the table does not allow, and arrows of the table that no way in the
/// picture stands for; rooms that may include everything are not drawn. `svg` is as Graphviz
/// writes it: each arrow has the title "from&#45;&gt;to".
std::vector<std::string> pictureBreaches(const House& house, const std::string& svg);
/// Files of more lines than `limit`.
std::vector<std::string> longFiles(const std::vector<SourceFile>& files, std::size_t limit);

}  // namespace zel::house
