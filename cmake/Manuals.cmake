# SPDX-License-Identifier: Apache-2.0
# Manuals and completions, made of what the programs tell about their options. When cross-compiling the programs run
# through CMAKE_CROSSCOMPILING_EMULATOR.
option(KELVASI_MANUALS "Make manuals and completions" ON)
set(KELVASI_ZSH_COMPLETIONS ${CMAKE_INSTALL_DATADIR}/zsh/site-functions CACHE STRING "Where zsh looks for completions")
if(NOT KELVASI_MANUALS OR KELVASI_SANITIZE OR KELVASI_ODR)
  return()
endif()
find_package(Python3 3.9 REQUIRED COMPONENTS Interpreter)
find_program(SCDOC scdoc)

set(MAKERS ${PROJECT_SOURCE_DIR}/Docs/Manuals)
set(MADE ${PROJECT_BINARY_DIR}/Manuals)
file(MAKE_DIRECTORY ${MADE})
foreach(PROGRAM kelvasi kelvasictl telvon-sim)
  add_custom_command(OUTPUT ${MADE}/${PROGRAM}.json COMMAND ${PROGRAM} --describe >${MADE}/${PROGRAM}.json
                     DEPENDS ${PROGRAM})
  list(APPEND TABLES ${MADE}/${PROGRAM}.json)
endforeach()

# kelvasi_made(NAME SCRIPT OPTION...): a folder of the build that a script makes of the programs' tables.
function(kelvasi_made NAME SCRIPT)
  file(GLOB PROSE CONFIGURE_DEPENDS ${MAKERS}/* ${PROJECT_SOURCE_DIR}/Docs/*.md)
  add_custom_command(OUTPUT ${MADE}/${NAME}.stamp
    COMMAND Python3::Interpreter -B ${MAKERS}/${SCRIPT} ${ARGN} --output ${MADE}/${NAME} ${TABLES}
    COMMAND ${CMAKE_COMMAND} -E touch ${MADE}/${NAME}.stamp
    DEPENDS ${TABLES} ${PROSE} ${PROJECT_SOURCE_DIR}/README.md COMMENT "Making ${NAME}" VERBATIM)
  set_property(GLOBAL APPEND PROPERTY KELVASI_MADE ${MADE}/${NAME}.stamp)
endfunction()

kelvasi_made(completions make_completions.py)
install(DIRECTORY ${MADE}/completions/bash/ DESTINATION ${CMAKE_INSTALL_DATADIR}/bash-completion/completions)
install(DIRECTORY ${MADE}/completions/zsh/ DESTINATION ${KELVASI_ZSH_COMPLETIONS})
install(DIRECTORY ${MADE}/completions/fish/ DESTINATION ${CMAKE_INSTALL_DATADIR}/fish/vendor_completions.d)

if(SCDOC)
  kelvasi_made(man make_manuals.py --scdoc ${SCDOC} --release ${PROJECT_VERSION})
  install(DIRECTORY ${MADE}/man/ DESTINATION ${CMAKE_INSTALL_MANDIR})
else()
  message(STATUS "Without scdoc there will be no manuals; it is Debian's package scdoc.")
endif()

get_property(RESULTS GLOBAL PROPERTY KELVASI_MADE)
add_custom_target(manuals ALL DEPENDS ${RESULTS})
