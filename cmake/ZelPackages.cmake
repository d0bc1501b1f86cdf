# The Debian packages, one a component: `cpack -G DEB` in the folder of a build, or scripts/packages.

set(CPACK_GENERATOR DEB)
set(CPACK_PACKAGE_NAME zelremote)
set(CPACK_PACKAGE_VENDOR "The ZELRemote developers")
set(CPACK_PACKAGE_CONTACT "The ZELRemote developers <support@zelremote.example>")
# Each package has a summary of its own.
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY "")
set(CPACK_PACKAGE_HOMEPAGE_URL "https://zelremote.example")
set(CPACK_PACKAGING_INSTALL_PREFIX "/usr")
set(CPACK_PACKAGE_DIRECTORY "${PROJECT_BINARY_DIR}/packages")
set(CPACK_STRIP_FILES ON)
# What is there is packed: nothing is built.
set(CMAKE_SKIP_INSTALL_ALL_DEPENDENCY ON)

set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_COMPONENTS_GROUPING IGNORE)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
set(CPACK_DEBIAN_PACKAGE_CONTROL_STRICT_PERMISSION ON)
set(CPACK_COMPONENTS_ALL "")

# zel_package(COMPONENT NAME SECTION SUMMARY DESCRIPTION)
#
# A package with its own copyright file and changelog.
macro(zel_package component name section summary description)
    string(TOUPPER ${component} upper)
    list(APPEND CPACK_COMPONENTS_ALL ${component})
    set(CPACK_DEBIAN_${upper}_PACKAGE_NAME ${name})
    set(CPACK_DEBIAN_${upper}_PACKAGE_SECTION ${section})
    set(CPACK_COMPONENT_${upper}_DESCRIPTION "${summary}\n${description}")
    set(PACKAGE ${name})
    set(changelog "${PROJECT_BINARY_DIR}/packaging/${name}/changelog")
    configure_file("${PROJECT_SOURCE_DIR}/packaging/debian/changelog.in" "${changelog}" @ONLY)
    execute_process(COMMAND gzip -9nkf "${changelog}" COMMAND_ERROR_IS_FATAL ANY)
    install(FILES "${changelog}.gz" "${PROJECT_SOURCE_DIR}/packaging/debian/copyright"
        DESTINATION "share/doc/${name}" COMPONENT ${component} EXCLUDE_FROM_ALL)
endmacro()

set(same "(= ${PROJECT_VERSION})")
zel_package(cli zelremote-cli science "console of ZEL3 handheld spectrum analysers"
"zelctl works a ZEL3 spectrum analyser from the console: single values,
sweeps, recordings, measurement scripts, the whole panel by name, and a
server for instruments at a distance. ZELSim is a simulated instrument.
No library of windows is needed; zelremote-draw adds pictures.")
set(CPACK_DEBIAN_CLI_PACKAGE_SUGGESTS "zelremote-draw ${same}, zelremote-server ${same}")

zel_package(draw zelremote-draw science "pictures of graphs for the console of ZELRemote"
"zeldraw draws graphs, waterfalls and spectrograms that zelctl gives it as
data into png, svg, pdf or wmf files.")
set(CPACK_DEBIAN_DRAW_PACKAGE_ENHANCES zelremote-cli)

zel_package(server zelremote-server science "server for a ZEL3 spectrum analyser at this computer"
"A unit that serves the instrument at a serial port over TCP, as
zelremote-server@ttyUSB0, and a udev rule that keeps modem managers off the
port.")
set(CPACK_DEBIAN_SERVER_PACKAGE_DEPENDS "zelremote-cli ${same}")
set(CPACK_DEBIAN_SERVER_PACKAGE_RECOMMENDS udev)  # a container has the ports without it
set(CPACK_DEBIAN_SERVER_PACKAGE_ARCHITECTURE all)
set(CPACK_DEBIAN_SERVER_PACKAGE_SHLIBDEPS OFF)
file(COPY_FILE "${PROJECT_SOURCE_DIR}/packaging/debian/udev.postinst"
    "${PROJECT_BINARY_DIR}/packaging/postinst")
file(CHMOD "${PROJECT_BINARY_DIR}/packaging/postinst" PERMISSIONS OWNER_READ OWNER_WRITE
    OWNER_EXECUTE GROUP_READ GROUP_EXECUTE WORLD_READ WORLD_EXECUTE)
set(CPACK_DEBIAN_SERVER_PACKAGE_CONTROL_EXTRA "${PROJECT_BINARY_DIR}/packaging/postinst")

if(TARGET zelremote)
    zel_package(desktop zelremote science "remote control of ZEL3 handheld spectrum analysers"
"The front panel of a ZEL3 spectrum analyser in a window: live sweeps,
markers, all measurement modes, saved views and recordings, scripts, a
waterfall and a spectrogram. The instrument is reached over a serial line,
modems or TCP.")
    # The help book is a data base.
    set(CPACK_DEBIAN_DESKTOP_PACKAGE_DEPENDS "zelremote-cli ${same}, libqt6sql6-sqlite")
endif()

include(CPack)
