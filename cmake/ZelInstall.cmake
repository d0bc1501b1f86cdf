# Where `cmake --install` puts the programs, what they need beside them, and the documents. Each file
# belongs to a component, which is a Debian package of its own (ZelPackages).

include(GNUInstallDirs)
set(ZEL_ZSH_COMPLETIONS "${CMAKE_INSTALL_DATAROOTDIR}/zsh/vendor-completions" CACHE PATH
    "Where zsh looks for completions")

# The folder of the program's companions, as the programs look for it from their own.
set(companions "${CMAKE_INSTALL_LIBDIR}/zelremote")
set(documents "${CMAKE_INSTALL_DATAROOTDIR}/doc/zelremote")
file(RELATIVE_PATH ZEL_COMPANIONS
    "/${CMAKE_INSTALL_BINDIR}" "/${companions}")

# The date of the sources, as in packages and metadata.
set(ZEL_SOURCE_DATE "$ENV{SOURCE_DATE_EPOCH}")
if(ZEL_SOURCE_DATE STREQUAL "")
    set(ZEL_SOURCE_DATE 0)
    find_package(Git QUIET)
    if(Git_FOUND)
        execute_process(COMMAND "${GIT_EXECUTABLE}" log -1 --format=%ct
            WORKING_DIRECTORY "${PROJECT_SOURCE_DIR}" OUTPUT_VARIABLE ZEL_SOURCE_DATE
            OUTPUT_STRIP_TRAILING_WHITESPACE ERROR_QUIET)
    endif()
endif()
set(ENV{SOURCE_DATE_EPOCH} "${ZEL_SOURCE_DATE}")
string(TIMESTAMP ZEL_RELEASE_DATE "%Y-%m-%d" UTC)
string(TIMESTAMP ZEL_CHANGELOG_DATE "%a, %d %b %Y %H:%M:%S +0000" UTC)

# zel_install_program(PROGRAM COMPONENT)
#
# The program with its manual page and its completion for bash.
function(zel_install_program program component)
    if(NOT TARGET ${program})
        return()
    endif()
    install(TARGETS ${program} RUNTIME DESTINATION "${CMAKE_INSTALL_BINDIR}" COMPONENT ${component})
    set(page "${PROJECT_BINARY_DIR}/packaging/${program}.1")
    configure_file("${PROJECT_SOURCE_DIR}/packaging/man/${program}.1" "${page}" @ONLY)
    execute_process(COMMAND gzip -9nkf "${page}" COMMAND_ERROR_IS_FATAL ANY)
    install(FILES "${page}.gz" DESTINATION "${CMAKE_INSTALL_MANDIR}/man1" COMPONENT ${component})
    install(FILES "${PROJECT_SOURCE_DIR}/packaging/completion/zelctl.bash"
        DESTINATION "${CMAKE_INSTALL_DATAROOTDIR}/bash-completion/completions" RENAME ${program}
        COMPONENT ${component})
endfunction()

# zel_install_desktop()
#
# What the desktop environment knows of the program.
function(zel_install_desktop)
    set(source "${PROJECT_SOURCE_DIR}/packaging")
    set(name example.zelremote.ZELRemote)
    configure_file("${source}/desktop/${name}.metainfo.xml"
        "${PROJECT_BINARY_DIR}/packaging/${name}.metainfo.xml" @ONLY)
    install(FILES "${source}/desktop/${name}.desktop"
        DESTINATION "${CMAKE_INSTALL_DATAROOTDIR}/applications" COMPONENT desktop)
    install(FILES "${PROJECT_BINARY_DIR}/packaging/${name}.metainfo.xml"
        DESTINATION "${CMAKE_INSTALL_DATAROOTDIR}/metainfo" COMPONENT desktop)
    install(FILES "${source}/desktop/zelremote.xml"
        DESTINATION "${CMAKE_INSTALL_DATAROOTDIR}/mime/packages" COMPONENT desktop)
    # The icon is that of the window; the small ones are drawn from it.
    install(FILES "${PROJECT_SOURCE_DIR}/desktop/pictures/application.svg"
        DESTINATION "${CMAKE_INSTALL_DATAROOTDIR}/icons/hicolor/scalable/apps"
        RENAME zelremote.svg COMPONENT desktop)
    foreach(size 48 128)
        install(FILES "${source}/icons/zelremote-${size}.png"
            DESTINATION "${CMAKE_INSTALL_DATAROOTDIR}/icons/hicolor/${size}x${size}/apps"
            RENAME zelremote.png COMPONENT desktop)
    endforeach()
endfunction()

# zel_install()
#
# Adds the rules, once the programs are known.
function(zel_install)
    zel_install_program(zelremote desktop)
    zel_install_program(zelctl cli)
    zel_install_program(ZELSim cli)
    zel_install_program(zeldraw draw)
    if(TARGET zelremote)
        zel_install_desktop()
    endif()
    install(FILES "${PROJECT_SOURCE_DIR}/packaging/completion/_zelctl"
        DESTINATION "${ZEL_ZSH_COMPLETIONS}" COMPONENT cli)

    # The panel starts the simulator from the folder of the companions.
    if(TARGET ZELSim)
        file(RELATIVE_PATH simulator "/${companions}/ZELSim" "/${CMAKE_INSTALL_BINDIR}/ZELSim")
        install(CODE "
            set(folder \"\$ENV{DESTDIR}\${CMAKE_INSTALL_PREFIX}/${companions}/ZELSim\")
            file(MAKE_DIRECTORY \"\${folder}\")
            file(CREATE_LINK \"${simulator}\" \"\${folder}/ZELSim\" SYMBOLIC)" COMPONENT cli)
    endif()

    # The files that a fresh application folder begins with, where there are any.
    install(DIRECTORY "${PROJECT_SOURCE_DIR}/defaults/" DESTINATION "${companions}/defaults"
        COMPONENT cli OPTIONAL)

    # The server is zelctl; this is what starts it, and keeps modem managers off its port.
    install(FILES "${PROJECT_SOURCE_DIR}/packaging/systemd/zelremote-server@.service"
        DESTINATION "lib/systemd/system" COMPONENT server)
    install(FILES "${PROJECT_SOURCE_DIR}/packaging/systemd/user/zelremote-server@.service"
        DESTINATION "lib/systemd/user" COMPONENT server)
    install(FILES "${PROJECT_SOURCE_DIR}/packaging/udev/70-zelremote.rules"
        DESTINATION "lib/udev/rules.d" COMPONENT server)

    install(FILES README.md CHANGELOG.md DESTINATION "${documents}" COMPONENT cli)
    # Packages name the licence of the system instead.
    install(FILES LICENSE DESTINATION "${documents}" COMPONENT licence)
    install(DIRECTORY docs/ DESTINATION "${documents}/docs" COMPONENT cli
        FILES_MATCHING PATTERN "*.md" PATTERN "*.png")
endfunction()
