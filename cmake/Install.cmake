# What `cmake --install` and `cpack -G DEB` put where: the game and its scenario runner in bin/, the pictures
# (and the sounds, from their own rule) in share/kruszarka/, the menu entry, icons and metainfo in the desktop's
# usual folders.
set(KRUSZARKA_ID io.github.kruszarka.kruszarka)
set(kruszarka_desktop ${PROJECT_SOURCE_DIR}/assets/desktop)

install(TARGETS kruszarka kruszarka-script RUNTIME DESTINATION ${CMAKE_INSTALL_BINDIR})
install(DIRECTORY ${PROJECT_SOURCE_DIR}/assets/pictures DESTINATION ${CMAKE_INSTALL_DATADIR}/kruszarka/assets
        FILES_MATCHING PATTERN "*.svg")
install(FILES ${kruszarka_desktop}/${KRUSZARKA_ID}.desktop DESTINATION ${CMAKE_INSTALL_DATADIR}/applications)
install(FILES ${kruszarka_desktop}/${KRUSZARKA_ID}.metainfo.xml DESTINATION ${CMAKE_INSTALL_DATADIR}/metainfo)

# The window icon is the menu icon: the SVG as it is, and fixed sizes drawn from it at build time.
set(kruszarka_icon_svg ${PROJECT_SOURCE_DIR}/assets/pictures/icon.svg)
set(kruszarka_icons ${CMAKE_INSTALL_DATADIR}/icons/hicolor)
install(FILES ${kruszarka_icon_svg} DESTINATION ${kruszarka_icons}/scalable/apps RENAME ${KRUSZARKA_ID}.svg)
add_executable(kruszarka-rasterise tools/rasterise_icon.cpp)
target_link_libraries(kruszarka-rasterise PRIVATE kruszarka_sdl)
kruszarka_warnings(kruszarka-rasterise)
set(kruszarka_icon_pngs)
foreach(size 16 24 32 48 64 128 256)
  set(png ${PROJECT_BINARY_DIR}/icons/${size}x${size}/${KRUSZARKA_ID}.png)
  add_custom_command(
    OUTPUT ${png}
    COMMAND ${CMAKE_COMMAND} -E make_directory ${PROJECT_BINARY_DIR}/icons/${size}x${size}
    COMMAND kruszarka-rasterise ${kruszarka_icon_svg} ${size} ${png}
    DEPENDS kruszarka-rasterise ${kruszarka_icon_svg}
    COMMENT "Drawing the ${size}x${size} menu icon"
    VERBATIM)
  list(APPEND kruszarka_icon_pngs ${png})
  install(FILES ${png} DESTINATION ${kruszarka_icons}/${size}x${size}/apps)
endforeach()
add_custom_target(kruszarka_icons ALL DEPENDS ${kruszarka_icon_pngs})

# The installed tree, moved elsewhere and started from a foreign folder, finds all the build folder finds.
add_test(NAME installed_tree
         COMMAND ${PROJECT_SOURCE_DIR}/tests/installed_tree_test.sh ${PROJECT_BINARY_DIR} ${KRUSZARKA_ID})
set_tests_properties(installed_tree PROPERTIES ENVIRONMENT "SDL_VIDEODRIVER=offscreen;SDL_AUDIODRIVER=dummy")

# cpack -G DEB: a package for Debian 12 whose dependencies dpkg-shlibdeps reads off the executables.
set(CPACK_GENERATOR DEB)
set(CPACK_PACKAGE_NAME kruszarka)
set(CPACK_PACKAGE_VENDOR "Kruszarka")
set(CPACK_PACKAGE_CONTACT "Kruszarka developers <kruszarka@localhost>")
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY "match-3 battles in a short military campaign (in Polish)")
set(CPACK_PACKAGE_DESCRIPTION "A single-player desktop game that joins a match-3 board to a short campaign of ten missions: shoot down enemies, open terminals and disarm bombs with runs of icons.")
set(CPACK_PACKAGING_INSTALL_PREFIX /usr)
set(CPACK_STRIP_FILES ON)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_SECTION games)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
# The fonts are opened by path, which no library dependency reveals.
set(CPACK_DEBIAN_PACKAGE_DEPENDS fonts-liberation)
include(CPack)
