# The language, the warnings and the switches of the build.

option(ZEL_WERROR "Treat warnings as errors" OFF)
option(ZEL_BENCH "Build the benches" ON)
option(ZEL_FUZZ "Build the fuzzers (needs Clang)" OFF)
option(ZEL_PRECOMPILE "Read the headers of the toolkit once for many sources" ON)

if(NOT CMAKE_BUILD_TYPE AND NOT CMAKE_CONFIGURATION_TYPES)
    set(CMAKE_BUILD_TYPE Release CACHE STRING "Kind of build" FORCE)
endif()

set(CMAKE_CXX_STANDARD 20)
set(CMAKE_CXX_STANDARD_REQUIRED ON)
set(CMAKE_CXX_EXTENSIONS OFF)
set(CMAKE_EXPORT_COMPILE_COMMANDS ON)

find_program(ZEL_CCACHE ccache)
mark_as_advanced(ZEL_CCACHE)
if(ZEL_CCACHE AND NOT CMAKE_CXX_COMPILER_LAUNCHER)
    # Without this the cache leaves out what uses precompiled headers.
    set(CMAKE_CXX_COMPILER_LAUNCHER "${CMAKE_COMMAND}" -E env
        CCACHE_SLOPPINESS=pch_defines,time_macros "${ZEL_CCACHE}")
endif()

add_compile_options(-Wall -Wextra -Wpedantic -Wshadow)
if(CMAKE_CXX_COMPILER_ID STREQUAL "GNU")
    # GCC 12 sees overlapping copies in plain string concatenations.
    add_compile_options(-Wno-restrict)
endif()
# The same sources give the same programs, wherever and whenever they are built.
add_compile_options(
    "$<$<CONFIG:Release>:-Wdate-time>"
    "$<$<CONFIG:Release>:-ffile-prefix-map=${PROJECT_SOURCE_DIR}=.>"
    "$<$<CONFIG:Release>:-ffile-prefix-map=${PROJECT_BINARY_DIR}=build>")
if(ZEL_WERROR)
    add_compile_options(-Werror)
endif()

# Every build checks what the library can check at little cost: bounds of the standard containers.
# A release is hard to misuse: bounds of the C functions, the stack, the tables of the linker.
if(CMAKE_SYSTEM_NAME STREQUAL "Linux")
    add_compile_options(
        -D_GLIBCXX_ASSERTIONS
        "$<$<CONFIG:Release>:-U_FORTIFY_SOURCE;-D_FORTIFY_SOURCE=3>"
        "$<$<CONFIG:Release>:-fstack-protector-strong;-fstack-clash-protection>")
    if(CMAKE_SYSTEM_PROCESSOR MATCHES "x86_64|AMD64")
        add_compile_options("$<$<CONFIG:Release>:-fcf-protection>")
    endif()
    add_link_options("$<$<CONFIG:Release>:-Wl,-z,relro,-z,now,-z,noexecstack>")
endif()

# zel_strict(TARGET)
#
# The further warnings, for a target that is free of them.
function(zel_strict target)
    target_compile_options(${target} PRIVATE -Wconversion -Wsign-conversion -Wold-style-cast
        -Wnon-virtual-dtor -Woverloaded-virtual)
endfunction()

# zel_late_library(TARGET NAME COMPONENT)
#
# A library that the programs load when they first need it. It stands in the folder "parts" beside
# them with their version in its name, and is installed with their companions.
function(zel_late_library target name component)
    string(REGEX REPLACE "^([0-9]+[.][0-9]+)[.]0$" "\\1" version "${PROJECT_VERSION}")
    set_target_properties(${target} PROPERTIES
        PREFIX "" OUTPUT_NAME "${name}-${version}" SUFFIX ".so" CXX_VISIBILITY_PRESET hidden
        LIBRARY_OUTPUT_DIRECTORY "${PROJECT_BINARY_DIR}/parts")
    target_include_directories(${target} PRIVATE "${PROJECT_SOURCE_DIR}")
    zel_strict(${target})
    install(TARGETS ${target} LIBRARY DESTINATION "${CMAKE_INSTALL_LIBDIR}/zelremote/parts"
        COMPONENT ${component})
endfunction()

# zel_window_libraries_first(TARGET)
#
# At its start a program looks for each name in its libraries one by one, in the order in which they
# were linked: those come first that have most of the names.
function(zel_window_libraries_first target)
    set(files "")
    foreach(library QCustomPlotQt6::QCustomPlotQt6 Qt6::Widgets Qt6::Core Qt6::Gui)
        list(APPEND files "$<TARGET_FILE:${library}>")
    endforeach()
    target_link_options(${target} PRIVATE
        "LINKER:--push-state,--no-as-needed" ${files} "LINKER:--pop-state")
endfunction()

# zel_precompile(TARGET HEADERS...)
#
# Headers of libraries, never of this tree: a source names all that it uses, and a change of ours
# compiles what it touches and nothing more.
function(zel_precompile target)
    if(ZEL_PRECOMPILE)
        target_precompile_headers(${target} PRIVATE ${ARGN})
        if(CMAKE_CXX_COMPILER_ID STREQUAL "GNU")
            target_compile_options(${target} PRIVATE -fpch-preprocess)
        endif()
    endif()
endfunction()

# What most windows use.
set(ZEL_WINDOW_HEADERS <QtWidgets> <qcustomplot.h> <functional> <map> <memory> <optional> <string>
    <vector>)

if(ZEL_FUZZ AND NOT CMAKE_CXX_COMPILER_ID MATCHES "Clang")
    message(FATAL_ERROR "ZEL_FUZZ needs Clang: -DCMAKE_CXX_COMPILER=clang++")
endif()
