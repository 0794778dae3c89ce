# The Debian package: cmake --build build/play --target package
set(CPACK_GENERATOR DEB)
set(CPACK_PACKAGE_NAME quorle)
set(CPACK_PACKAGE_VERSION ${PROJECT_VERSION})
set(CPACK_PACKAGE_CONTACT "Quorle developers <quorle@quorle.github.io>")
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY "timed word-finding game on a board of letter cubes")
set(CPACK_PACKAGE_DESCRIPTION
"Sixteen letter cubes are shaken into a board of four by four. Find as many
words as you can before the time runs out: each is spelled by a chain of
touching cubes, and no cube counts twice in a word.
.
The game comes with a dictionary of some 117,000 words, which the player can
correct, edit, and merge with word lists.")
set(CPACK_PACKAGING_INSTALL_PREFIX /usr)
set(CPACK_PACKAGE_DIRECTORY ${PROJECT_BINARY_DIR}/package)
set(CPACK_STRIP_FILES TRUE)
set(CPACK_INSTALL_DEFAULT_DIRECTORY_PERMISSIONS
  OWNER_READ OWNER_WRITE OWNER_EXECUTE GROUP_READ GROUP_EXECUTE WORLD_READ WORLD_EXECUTE)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_SECTION games)
set(CPACK_DEBIAN_PACKAGE_HOMEPAGE "${QUORLE_HOME_PAGE}")
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS TRUE)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS_PRIVATE_DIRS ${CMAKE_LIBRARY_OUTPUT_DIRECTORY})
# Loaded when wanted, so it is not found among what the program links.
set(CPACK_DEBIAN_PACKAGE_DEPENDS "libcanberra0 (>= 0.2)")
set(CPACK_DEBIAN_PACKAGE_RECOMMENDS
  "fonts-liberation, libcanberra-pulse, qt6-wayland, sound-theme-freedesktop")
set(CPACK_DEBIAN_PACKAGE_CONTROL_STRICT_PERMISSION TRUE)
include(CPack)
