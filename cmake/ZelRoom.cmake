# The helpers that make targets out of folders.

# The libraries of all rooms that have been made so far.
set_property(GLOBAL PROPERTY ZEL_ROOMS "")

# zel_room(NAME [SUBFOLDERS folders...] [DEPENDS rooms...])
#
# Makes the library zel_NAME of the sources in the folder NAME and the named subfolders: a static
# one, or an interface when there are headers only. Nothing when the folder is empty; rooms it
# depends on that do not exist are left out.
function(zel_room name)
    cmake_parse_arguments(room "" "" "SUBFOLDERS;DEPENDS" ${ARGN})
    set(folders "${PROJECT_SOURCE_DIR}/${name}")
    foreach(subfolder IN LISTS room_SUBFOLDERS)
        list(APPEND folders "${PROJECT_SOURCE_DIR}/${name}/${subfolder}")
    endforeach()
    set(sources "")
    set(headers "")
    foreach(folder IN LISTS folders)
        file(GLOB found CONFIGURE_DEPENDS "${folder}/*.cpp")
        list(APPEND sources ${found})
        file(GLOB found CONFIGURE_DEPENDS "${folder}/*.h")
        list(APPEND headers ${found})
    endforeach()

    if(sources)
        set(visibility PUBLIC)
        add_library(zel_${name} STATIC ${sources} ${headers})
        zel_strict(zel_${name})
    elseif(headers)
        set(visibility INTERFACE)
        add_library(zel_${name} INTERFACE)
    else()
        return()
    endif()
    target_include_directories(zel_${name} ${visibility} "${PROJECT_SOURCE_DIR}")
    foreach(other IN LISTS room_DEPENDS)
        if(TARGET zel_${other})
            target_link_libraries(zel_${name} ${visibility} zel_${other})
        endif()
    endforeach()
    set_property(GLOBAL APPEND PROPERTY ZEL_ROOMS zel_${name})
endfunction()

# zel_check_core()
#
# Fails when a room of the core could see a library of a front: what the rooms are linked to, and
# with it the folders of their headers, are rooms again.
function(zel_check_core)
    get_property(rooms GLOBAL PROPERTY ZEL_ROOMS)
    foreach(room IN LISTS rooms)
        foreach(property IN ITEMS LINK_LIBRARIES INTERFACE_LINK_LIBRARIES)
            get_target_property(libraries ${room} ${property})
            foreach(library IN LISTS libraries)
                if(library AND NOT library IN_LIST rooms)
                    message(FATAL_ERROR "${room} is of the core and may not use ${library}")
                endif()
            endforeach()
        endforeach()
        get_target_property(folders ${room} INTERFACE_INCLUDE_DIRECTORIES)
        if(NOT folders STREQUAL "${PROJECT_SOURCE_DIR}")
            message(FATAL_ERROR "${room} is of the core and may not see ${folders}")
        endif()
    endforeach()
endfunction()

# zel_link_core(TARGET VISIBILITY)
#
# Links a target to every room of the core that exists.
function(zel_link_core target visibility)
    get_property(rooms GLOBAL PROPERTY ZEL_ROOMS)
    list(REVERSE rooms)
    target_link_libraries(${target} ${visibility} ${rooms})
endfunction()

# zel_link_existing(TARGET VISIBILITY libraries...)
#
# Links a target to those of the named libraries that exist.
function(zel_link_existing target visibility)
    foreach(library IN LISTS ARGN)
        if(TARGET ${library})
            target_link_libraries(${target} ${visibility} ${library})
        endif()
    endforeach()
endfunction()

# zel_subdirectory(NAME): add_subdirectory where the folder has a CMakeLists.txt.
macro(zel_subdirectory name)
    if(EXISTS "${PROJECT_SOURCE_DIR}/${name}/CMakeLists.txt")
        add_subdirectory(${name})
    endif()
endmacro()

# zel_house_picture()
#
# Adds `house_picture`, which draws docs/images/house.svg out of the table of rooms, where Graphviz
# is installed. The build draws it into its own folder each time the table changes.
function(zel_house_picture)
    find_program(ZEL_DOT dot)
    find_program(ZEL_TRED tred)
    mark_as_advanced(ZEL_DOT ZEL_TRED)
    if(NOT ZEL_DOT OR NOT ZEL_TRED)
        return()
    endif()
    set(page "${PROJECT_SOURCE_DIR}/docs/architecture.md")
    set(script "${PROJECT_SOURCE_DIR}/cmake/HousePicture.cmake")
    set(picture "${PROJECT_BINARY_DIR}/house.svg")
    add_custom_command(OUTPUT "${picture}"
        COMMAND "${CMAKE_COMMAND}" "-DPAGE=${page}" "-DPICTURE=${picture}" "-DDOT=${ZEL_DOT}"
            "-DTRED=${ZEL_TRED}" -P "${script}"
        DEPENDS "${page}" "${script}"
        COMMENT "Drawing the rooms" VERBATIM)
    add_custom_target(zel_house_picture ALL DEPENDS "${picture}")
    add_custom_target(house_picture
        COMMAND "${CMAKE_COMMAND}" -E copy "${picture}"
            "${PROJECT_SOURCE_DIR}/docs/images/house.svg"
        DEPENDS "${picture}" VERBATIM)
endfunction()
