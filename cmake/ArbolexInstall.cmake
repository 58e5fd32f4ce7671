# `cmake --install`: the programs, the default data folder, and what a desktop
# needs to list ARBOLEX, show its icon and open .arbolex files with it.
#
#   bin/arbolex, bin/arbolex-cli
#   share/arbolex/data/                                  the default data folder
#   share/doc/arbolex/examples/                          the example estate
#   share/applications/org.arbolex.Arbolex.desktop
#   share/icons/hicolor/scalable/apps/org.arbolex.Arbolex.svg
#   share/metainfo/org.arbolex.Arbolex.metainfo.xml
#   share/mime/packages/org.arbolex.Arbolex.xml         application/x-arbolex
#
# An installed program finds its defaults by the relative path from bin/ to
# share/arbolex/data (src/CMakeLists.txt) and works in the user's data location.
set(ARBOLEX_APP_ID org.arbolex.Arbolex)
set(ARBOLEX_DIST ${CMAKE_SOURCE_DIR}/dist)

if(TARGET arbolex-cli)
    install(TARGETS arbolex-cli RUNTIME DESTINATION ${CMAKE_INSTALL_BINDIR})
    # The examples are the user's to copy, not defaults the program fills in.
    install(DIRECTORY ${CMAKE_SOURCE_DIR}/data/ DESTINATION ${CMAKE_INSTALL_DATADIR}/arbolex/data
        PATTERN examples EXCLUDE)
    install(DIRECTORY ${CMAKE_SOURCE_DIR}/data/examples/ DESTINATION ${CMAKE_INSTALL_DOCDIR}/examples)
endif()

if(TARGET arbolex)
    install(TARGETS arbolex RUNTIME DESTINATION ${CMAKE_INSTALL_BINDIR})
    install(FILES ${ARBOLEX_DIST}/${ARBOLEX_APP_ID}.desktop
        DESTINATION ${CMAKE_INSTALL_DATADIR}/applications)
    install(FILES ${ARBOLEX_DIST}/${ARBOLEX_APP_ID}.svg
        DESTINATION ${CMAKE_INSTALL_DATADIR}/icons/hicolor/scalable/apps)
    install(FILES ${ARBOLEX_DIST}/${ARBOLEX_APP_ID}.metainfo.xml
        DESTINATION ${CMAKE_INSTALL_DATADIR}/metainfo)
    install(FILES ${ARBOLEX_DIST}/${ARBOLEX_APP_ID}.mime.xml
        DESTINATION ${CMAKE_INSTALL_DATADIR}/mime/packages RENAME ${ARBOLEX_APP_ID}.xml)
endif()
