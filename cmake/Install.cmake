# SPDX-License-Identifier: Apache-2.0
# Where everything goes that is installed, as GNUInstallDirs has it, and how it is taken away again.
set(RESOURCES ${PROJECT_SOURCE_DIR}/Resources)

install(TARGETS kelvasi kelvasictl telvon-sim)
install(DIRECTORY ${RESOURCES}/ DESTINATION ${CMAKE_INSTALL_DATADIR}/kelvasi FILES_MATCHING PATTERN "*.plist"
        PATTERN "*.lua" PATTERN colorfilters PATTERN systemd EXCLUDE)

# kelvasi_installed(DIRECTORY [PROGRAMS] FILE...): files of the source tree. One whose name ends in .in is told where the
# programs are, which is known when it is installed.
function(kelvasi_installed DIRECTORY)
  cmake_parse_arguments(ARG "PROGRAMS" "" "" ${ARGN})
  set(KIND FILES)
  if(ARG_PROGRAMS)
    set(KIND PROGRAMS)
  endif()
  foreach(FILE ${ARG_UNPARSED_ARGUMENTS})
    cmake_path(GET FILE FILENAME NAME)
    if(NAME MATCHES "\\.in$")
      string(REGEX REPLACE "\\.in$" "" NAME ${NAME})
      set(TOLD ${PROJECT_BINARY_DIR}/Installed/${NAME})
      install(CODE "set(BINDIR \"${CMAKE_INSTALL_BINDIR}\")
        set(LIBEXECDIR \"${CMAKE_INSTALL_LIBEXECDIR}\")
        cmake_path(ABSOLUTE_PATH BINDIR BASE_DIRECTORY \"\${CMAKE_INSTALL_PREFIX}\")
        cmake_path(ABSOLUTE_PATH LIBEXECDIR BASE_DIRECTORY \"\${CMAKE_INSTALL_PREFIX}\")
        configure_file(\"${FILE}\" \"${TOLD}\" @ONLY)")
      set(FILE ${TOLD})
    endif()
    install(${KIND} ${FILE} DESTINATION ${DIRECTORY})
  endforeach()
endfunction()

# Beside a viewer in /usr these are where desktops and systemd look.
set(NAME org.kelvasi.Kelvasi)
set(SHARE ${CMAKE_INSTALL_DATADIR})
kelvasi_installed(${SHARE}/applications ${RESOURCES}/${NAME}.desktop ${RESOURCES}/org.kelvasi.Decode.desktop.in)
kelvasi_installed(${CMAKE_INSTALL_LIBEXECDIR}/kelvasi PROGRAMS ${RESOURCES}/show-captures.in)
kelvasi_installed(${SHARE}/dbus-1/services ${RESOURCES}/${NAME}.service.in)
kelvasi_installed(${SHARE}/icons/hicolor/scalable/apps ${RESOURCES}/${NAME}.svg)
kelvasi_installed(${SHARE}/icons/hicolor/symbolic/apps ${RESOURCES}/${NAME}-symbolic.svg)
kelvasi_installed(${SHARE}/metainfo ${RESOURCES}/${NAME}.metainfo.xml)
install(FILES ${RESOURCES}/${NAME}.mime.xml DESTINATION ${SHARE}/mime/packages RENAME ${NAME}.xml)
foreach(UNIT telvon-sim kelvasi-record kelvasi-kiosk)
  kelvasi_installed(lib/systemd/user ${RESOURCES}/systemd/${UNIT}.service.in)
endforeach()

# Where Wireshark of the same prefix looks. The dissector is made by the program that was built, where that can run.
set(WIRESHARK ${CMAKE_INSTALL_LIBDIR}/wireshark)
kelvasi_installed(${WIRESHARK}/extcap PROGRAMS ${RESOURCES}/wireshark/kelvasi-extcap.in)
if(NOT KELVASI_ODR AND NOT KELVASI_SANITIZE AND (NOT CMAKE_CROSSCOMPILING OR CMAKE_CROSSCOMPILING_EMULATOR))
  set(DISSECTOR ${PROJECT_BINARY_DIR}/Installed/kelvasi.lua)
  file(MAKE_DIRECTORY ${PROJECT_BINARY_DIR}/Installed)
  file(GLOB SCRIPTS CONFIGURE_DEPENDS ${RESOURCES}/wireshark/*.lua ${RESOURCES}/*.plist)
  add_custom_command(OUTPUT ${DISSECTOR} COMMAND kelvasictl dissector --resources ${RESOURCES} > ${DISSECTOR}
                     DEPENDS kelvasictl ${SCRIPTS} VERBATIM)
  add_custom_target(dissector ALL DEPENDS ${DISSECTOR})
  install(FILES ${DISSECTOR} DESTINATION ${WIRESHARK}/plugins)
endif()

file(GLOB NOTICES CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/Notices/*)
install(FILES ${PROJECT_SOURCE_DIR}/LICENSES/Apache-2.0.txt DESTINATION ${CMAKE_INSTALL_DOCDIR} RENAME LICENSE)
kelvasi_installed(${CMAKE_INSTALL_DOCDIR} ${PROJECT_SOURCE_DIR}/CHANGELOG.md)
kelvasi_installed(${CMAKE_INSTALL_DOCDIR}/Notices ${NOTICES})

add_custom_target(uninstall COMMAND ${CMAKE_COMMAND} -P ${CMAKE_CURRENT_LIST_DIR}/Uninstall.cmake
                  WORKING_DIRECTORY ${PROJECT_BINARY_DIR} VERBATIM)
