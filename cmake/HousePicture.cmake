# Draws the rooms and their arrows out of the table of docs/architecture.md:
#
#   cmake -DPAGE=docs/architecture.md -DPICTURE=house.svg -DDOT=dot -DTRED=tred -P HousePicture.cmake
#
# An arrow that a longer way makes plain is left out, and so are the rooms that may include
# everything.

file(STRINGS "${PAGE}" lines)
set(inside FALSE)
set(graph "digraph house {\n")
string(APPEND graph "  bgcolor=white; nodesep=0.25; ranksep=0.4;\n")
string(APPEND graph "  node [shape=box, style=\"rounded,filled\", fillcolor=\"#eef3fb\",")
string(APPEND graph " color=\"#5b7db1\", fontname=\"sans-serif\", fontsize=12, height=0.35];\n")
string(APPEND graph "  edge [color=\"#7a7a7a\", arrowsize=0.6];\n")
foreach(line IN LISTS lines)
    if(line MATCHES "^## ")
        set(inside FALSE)
    endif()
    if(line STREQUAL "## Allowed arrows")
        set(inside TRUE)
    endif()
    if(NOT inside OR NOT line MATCHES "^\\| `([^`]+)`[^|]*\\|([^|]*)\\|([^|]*)\\|")
        continue()
    endif()
    set(room "${CMAKE_MATCH_1}")
    set(arrows "${CMAKE_MATCH_2}")
    set(standard "${CMAKE_MATCH_3}")
    if(arrows MATCHES "everything")
        continue()
    endif()
    set(fill "")
    if(NOT standard MATCHES "yes")
        set(fill " [fillcolor=\"#fdf3e0\", color=\"#b98a3a\"]")
    endif()
    string(APPEND graph "  \"${room}\"${fill};\n")
    string(REGEX MATCHALL "`[^`]+`" targets "${arrows}")
    foreach(target IN LISTS targets)
        string(REPLACE "`" "" target "${target}")
        string(APPEND graph "  \"${room}\" -> \"${target}\";\n")
    endforeach()
endforeach()
string(APPEND graph "}\n")

file(WRITE "${PICTURE}.dot" "${graph}")
execute_process(
    COMMAND "${TRED}" "${PICTURE}.dot"
    COMMAND "${DOT}" -Tsvg -o "${PICTURE}"
    RESULTS_VARIABLE results ERROR_VARIABLE problems)
foreach(result IN LISTS results)
    if(NOT result EQUAL 0)
        message(FATAL_ERROR "The picture of the house was not drawn: ${problems}")
    endif()
endforeach()
