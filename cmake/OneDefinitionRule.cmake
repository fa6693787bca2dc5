# SPDX-License-Identifier: Apache-2.0
# Every library and every program in one object, so that what two programs call by one name is found too.
get_property(PARTS GLOBAL PROPERTY KELVASI_PARTS)
foreach(PART ${PARTS})
  list(APPEND OBJECTS $<TARGET_OBJECTS:${PART}>)
endforeach()

# Only main() may be there once for each program.
get_property(PROGRAMS GLOBAL PROPERTY KELVASI_PROGRAMS)
foreach(PROGRAM ${PROGRAMS})
  string(MAKE_C_IDENTIFIER main_of_${PROGRAM} MAIN)
  get_target_property(FOLDER ${PROGRAM} SOURCE_DIR)
  set_source_files_properties(${FOLDER}/main.cpp TARGET_DIRECTORY ${PROGRAM} PROPERTIES
    COMPILE_DEFINITIONS main=${MAIN} SKIP_PRECOMPILE_HEADERS ON)
endforeach()

add_executable(odr ${OBJECTS})
set_target_properties(odr PROPERTIES LINKER_LANGUAGE CXX)
target_link_options(odr PRIVATE -r -nostdlib -Wodr -Werror=odr)
