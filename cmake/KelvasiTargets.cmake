# SPDX-License-Identifier: Apache-2.0
# How every target of the project is compiled.
add_library(kelvasi_options INTERFACE)
target_compile_options(kelvasi_options INTERFACE -Wall -Wextra -Wconversion -Wshadow)
target_include_directories(kelvasi_options INTERFACE ${PROJECT_SOURCE_DIR})
if(KELVASI_MAP_PATHS)
  target_compile_options(kelvasi_options INTERFACE -ffile-prefix-map=${PROJECT_SOURCE_DIR}=.
                                                   -ffile-prefix-map=${PROJECT_BINARY_DIR}=build)
endif()
if(KELVASI_SANITIZE)
  target_compile_options(kelvasi_options INTERFACE -fsanitize=${KELVASI_SANITIZE} -fno-omit-frame-pointer
                                                   -fno-sanitize-recover=all)
  # GCC takes moved-from members for uninitialised ones in instrumented code, in <regex> for one.
  target_compile_options(kelvasi_options INTERFACE $<$<CXX_COMPILER_ID:GNU>:-Wno-maybe-uninitialized>)
  target_link_options(kelvasi_options INTERFACE -fsanitize=${KELVASI_SANITIZE})
endif()

# Tests are compiled for the time until they run: what they test is optimised, they themselves are not.
add_library(kelvasi_test_options INTERFACE)
target_compile_options(kelvasi_test_options INTERFACE -O0 -g1)
target_link_libraries(kelvasi_test_options INTERFACE kelvasi_options)

# kelvasi_sources(OUT [EXCEPT ...]): the sources of the folder and of the rooms in it, found anew when some come or go.
# A room with a CMakeLists.txt is a target of its own.
function(kelvasi_sources OUT)
  cmake_parse_arguments(ARG "" "" "EXCEPT" ${ARGN})
  file(GLOB_RECURSE FOUND CONFIGURE_DEPENDS RELATIVE ${CMAKE_CURRENT_SOURCE_DIR} *.cpp)
  file(GLOB_RECURSE TARGETS CONFIGURE_DEPENDS RELATIVE ${CMAKE_CURRENT_SOURCE_DIR} CMakeLists.txt)
  list(REMOVE_ITEM TARGETS CMakeLists.txt)
  foreach(TARGET ${TARGETS})
    cmake_path(GET TARGET PARENT_PATH ROOM)
    list(FILTER FOUND EXCLUDE REGEX "^${ROOM}/")
  endforeach()
  list(REMOVE_ITEM FOUND ${ARG_EXCEPT})
  set(${OUT} ${FOUND} PARENT_SCOPE)
endfunction()

# kelvasi_library(NAME [PRECOMPILED set] [ALSO ...] [LINK ...]): one folder of the house, all but its main(), and also
# these sources; the target is kelvasi_NAME.
function(kelvasi_library NAME)
  cmake_parse_arguments(ARG "" "PRECOMPILED" "ALSO;LINK" ${ARGN})
  kelvasi_sources(SOURCES EXCEPT main.cpp)
  add_library(kelvasi_${NAME} STATIC ${SOURCES} ${ARG_ALSO})
  set_property(GLOBAL APPEND PROPERTY KELVASI_PARTS kelvasi_${NAME})
  target_link_libraries(kelvasi_${NAME} PUBLIC kelvasi_options ${ARG_LINK})
  kelvasi_precompiled(kelvasi_${NAME} ${ARG_PRECOMPILED} standard)
endfunction()

# kelvasi_program(NAME [PRECOMPILED set] SOURCES ... [LINK ...]): what a user starts, in the build's Tools/.
function(kelvasi_program NAME)
  cmake_parse_arguments(ARG "" "PRECOMPILED" "SOURCES;LINK" ${ARGN})
  if(KELVASI_ODR)
    add_library(${NAME} OBJECT ${ARG_SOURCES})
  else()
    add_executable(${NAME} ${ARG_SOURCES})
  endif()
  set_property(GLOBAL APPEND PROPERTY KELVASI_PARTS ${NAME})
  set_property(GLOBAL APPEND PROPERTY KELVASI_PROGRAMS ${NAME})
  target_link_libraries(${NAME} PRIVATE kelvasi_options ${ARG_LINK})
  kelvasi_precompiled(${NAME} ${ARG_PRECOMPILED} standard)
  set_target_properties(${NAME} PROPERTIES RUNTIME_OUTPUT_DIRECTORY ${PROJECT_BINARY_DIR}/Tools)
endfunction()

# kelvasi_test(NAME [PRECOMPILED set] [SOURCES ... | EXCEPT ... ALSO ...] [LINK ...]): a GoogleTest program of the
# folder's sources, or of those given, whose cases CTest runs one by one.
function(kelvasi_test NAME)
  cmake_parse_arguments(ARG "" "PRECOMPILED" "SOURCES;EXCEPT;ALSO;LINK" ${ARGN})
  if(NOT ARG_SOURCES)
    kelvasi_sources(ARG_SOURCES EXCEPT ${ARG_EXCEPT})
  endif()
  add_executable(${NAME} ${ARG_SOURCES} ${ARG_ALSO})
  target_link_libraries(${NAME} PRIVATE kelvasi_test_options ${ARG_LINK} GTest::gmock GTest::gtest_main)
  kelvasi_precompiled(${NAME} ${ARG_PRECOMPILED} test)
  gtest_discover_tests(${NAME} DISCOVERY_TIMEOUT 60 PROPERTIES TIMEOUT 120)
endfunction()
