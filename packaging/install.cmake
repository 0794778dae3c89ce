# Where everything goes under the prefix. The engine is private to the program,
# which finds it relative to itself, so that an installed tree can be moved.
set(QUORLE_COMPONENT_ID io.github.quorle.quorle CACHE STRING "AppStream id of the program")
set(QUORLE_HOME_PAGE https://quorle.github.io CACHE STRING "Web address of the project")
set(QUORLE_BASE_ADDRESS "" CACHE STRING "Web address of the sources; empty: no pictures are named")
set(QUORLE_RELEASE_DATE 2026-11-25)

set(games games)
set(library ${CMAKE_INSTALL_LIBDIR}/games/quorle)
set(share ${CMAKE_INSTALL_DATADIR})
set(doc ${CMAKE_INSTALL_DATADIR}/doc/quorle)
set(sources ${CMAKE_CURRENT_LIST_DIR})
set(made ${PROJECT_BINARY_DIR}/packaging)

file(RELATIVE_PATH library_from_games /prefix/${games} /prefix/${library})
# One run path for the installed and the built program: one that is changed on installing is filled
# up with empty entries before, which stand for the current folder.
set_target_properties(quorle PROPERTIES BUILD_WITH_INSTALL_RPATH ON
  INSTALL_RPATH "$ORIGIN/${library_from_games};$ORIGIN/../lib")
add_dependencies(quorle program_folder)

if(QUORLE_BASE_ADDRESS)
  set(pictures ${QUORLE_BASE_ADDRESS}/packaging/pictures)
  string(CONFIGURE [[
  <screenshots>
    <screenshot type="default"><image>@pictures@/board.png</image></screenshot>
    <screenshot><image>@pictures@/results.png</image></screenshot>
    <screenshot><image>@pictures@/editor.png</image></screenshot>
  </screenshots>
]] QUORLE_WEB_ELEMENTS @ONLY)
endif()
# AppStream 1.0 gave the developer another element, which earlier versions refuse.
set(QUORLE_DEVELOPER [[<developer id="io.github.quorle"><name>Quorle developers</name></developer>]])
execute_process(COMMAND appstreamcli --version OUTPUT_VARIABLE appstream_version
  RESULT_VARIABLE no_appstream ERROR_QUIET)
if(NOT no_appstream AND appstream_version MATCHES " 0\\.")
  set(QUORLE_DEVELOPER "<developer_name>Quorle developers</developer_name>")
endif()
set(metainfo ${made}/${QUORLE_COMPONENT_ID}.metainfo.xml)
configure_file(${sources}/quorle.metainfo.xml.in ${metainfo} @ONLY)

file(READ ${PROJECT_SOURCE_DIR}/LICENSE license)
file(READ ${PROJECT_SOURCE_DIR}/NOTICE notice)
file(CONFIGURE OUTPUT ${made}/copyright @ONLY
  CONTENT "Quorle, a word-finding game\n\n@license@\n\nThe default dictionary\n\n@notice@")
foreach(text changelog quorle.6)
  set_property(DIRECTORY APPEND PROPERTY CMAKE_CONFIGURE_DEPENDS ${sources}/${text})
  execute_process(COMMAND gzip -9nc ${sources}/${text} OUTPUT_FILE ${made}/${text}.gz
    COMMAND_ERROR_IS_FATAL ANY)
endforeach()

install(TARGETS quorle RUNTIME DESTINATION ${games})
install(TARGETS Quorle LIBRARY DESTINATION ${library})
install(FILES ${QUORLE_DICTIONARY}
  ${PROJECT_SOURCE_DIR}/help/Quorle.htm ${PROJECT_SOURCE_DIR}/help/Quorle.png
  DESTINATION ${share}/quorle)
install(FILES ${sources}/quorle.desktop DESTINATION ${share}/applications)
install(FILES ${metainfo} DESTINATION ${share}/metainfo)
install(FILES ${made}/quorle.6.gz DESTINATION ${CMAKE_INSTALL_MANDIR}/man6)
install(FILES ${made}/copyright ${made}/changelog.gz DESTINATION ${doc})
install(FILES ${sources}/icons/quorle.svg DESTINATION ${share}/icons/hicolor/scalable/apps)
foreach(size 48 128 256)
  install(FILES ${sources}/icons/quorle-${size}.png RENAME quorle.png
    DESTINATION ${share}/icons/hicolor/${size}x${size}/apps)
endforeach()
