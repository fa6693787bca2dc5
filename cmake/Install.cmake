# SPDX-License-Identifier: Apache-2.0
# Where everything goes that is installed, as GNUInstallDirs has it, and how it is taken away again.
set(RESOURCES ${PROJECT_SOURCE_DIR}/Resources)

install(TARGETS kelvasi kelvasictl telvon-sim)
install(DIRECTORY ${RESOURCES}/ DESTINATION ${CMAKE_INSTALL_DATADIR}/kelvasi FILES_MATCHING PATTERN "*.plist")

# kelvasi_installed(DIRECTORY FILE...): files of the source tree, with what the configuration knows where they end in .in.
function(kelvasi_installed DIRECTORY)
  foreach(FILE ${ARGN})
    cmake_path(GET FILE FILENAME NAME)
    if(NAME MATCHES "\\.in$")
      string(REGEX REPLACE "\\.in$" "" NAME ${NAME})
      configure_file(${FILE} ${PROJECT_BINARY_DIR}/Installed/${NAME} @ONLY)
      set(FILE ${PROJECT_BINARY_DIR}/Installed/${NAME})
    endif()
    install(FILES ${FILE} DESTINATION ${DIRECTORY})
  endforeach()
endfunction()

set(NAME org.kelvasi.Kelvasi)
kelvasi_installed(${CMAKE_INSTALL_DATADIR}/applications ${RESOURCES}/${NAME}.desktop)
kelvasi_installed(${CMAKE_INSTALL_DATADIR}/icons/hicolor/scalable/apps ${RESOURCES}/${NAME}.svg)

file(GLOB NOTICES CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/Notices/*)
install(FILES ${PROJECT_SOURCE_DIR}/LICENSES/Apache-2.0.txt DESTINATION ${CMAKE_INSTALL_DOCDIR} RENAME LICENSE)
kelvasi_installed(${CMAKE_INSTALL_DOCDIR} ${PROJECT_SOURCE_DIR}/CHANGELOG.md)
kelvasi_installed(${CMAKE_INSTALL_DOCDIR}/Notices ${NOTICES})

add_custom_target(uninstall COMMAND ${CMAKE_COMMAND} -P ${CMAKE_CURRENT_LIST_DIR}/Uninstall.cmake
                  WORKING_DIRECTORY ${PROJECT_BINARY_DIR} VERBATIM)
