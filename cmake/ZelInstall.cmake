# Where `cmake --install` puts the programs, what they need beside them, and the documents.

include(GNUInstallDirs)

# The folder of the program's companions, as the programs look for it from their own.
set(companions "${CMAKE_INSTALL_LIBDIR}/zelremote")
file(RELATIVE_PATH ZEL_COMPANIONS
    "/${CMAKE_INSTALL_BINDIR}" "/${companions}")

# zel_install()
#
# Adds the rules, once the programs are known.
function(zel_install)
    foreach(program zelremote zelctl zeldraw ZELSim)
        if(TARGET ${program})
            install(TARGETS ${program} RUNTIME DESTINATION "${CMAKE_INSTALL_BINDIR}")
        endif()
    endforeach()

    # The panel starts the simulator from the folder of the companions.
    if(TARGET ZELSim)
        file(RELATIVE_PATH simulator "/${companions}/ZELSim" "/${CMAKE_INSTALL_BINDIR}/ZELSim")
        install(CODE "
            set(folder \"\$ENV{DESTDIR}\${CMAKE_INSTALL_PREFIX}/${companions}/ZELSim\")
            file(MAKE_DIRECTORY \"\${folder}\")
            file(CREATE_LINK \"${simulator}\" \"\${folder}/ZELSim\" SYMBOLIC)")
    endif()

    # The files that a fresh application folder begins with, where there are any.
    install(DIRECTORY "${PROJECT_SOURCE_DIR}/defaults/" DESTINATION "${companions}/defaults" OPTIONAL)

    install(FILES README.md CHANGELOG.md LICENSE DESTINATION "${CMAKE_INSTALL_DOCDIR}")
    install(DIRECTORY docs/ DESTINATION "${CMAKE_INSTALL_DOCDIR}/docs"
        FILES_MATCHING PATTERN "*.md" PATTERN "*.png")
endfunction()
