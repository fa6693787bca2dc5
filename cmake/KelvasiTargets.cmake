# How every target of the project is compiled.
add_library(kelvasi_options INTERFACE)
target_compile_options(kelvasi_options INTERFACE -Wall -Wextra -Wconversion -Wshadow)
target_include_directories(kelvasi_options INTERFACE ${PROJECT_SOURCE_DIR})
if(KELVASI_SANITIZE)
  target_compile_options(kelvasi_options INTERFACE -fsanitize=${KELVASI_SANITIZE} -fno-omit-frame-pointer
                                                   -fno-sanitize-recover=all)
  # GCC takes moved-from members for uninitialised ones in instrumented code, in <regex> for one.
  target_compile_options(kelvasi_options INTERFACE $<$<CXX_COMPILER_ID:GNU>:-Wno-maybe-uninitialized>)
  target_link_options(kelvasi_options INTERFACE -fsanitize=${KELVASI_SANITIZE})
endif()

# kelvasi_library(NAME SOURCES ... [LINK ...]): one folder of the house; the target is kelvasi_NAME.
function(kelvasi_library NAME)
  cmake_parse_arguments(ARG "" "" "SOURCES;LINK" ${ARGN})
  add_library(kelvasi_${NAME} STATIC ${ARG_SOURCES})
  target_link_libraries(kelvasi_${NAME} PUBLIC kelvasi_options ${ARG_LINK})
endfunction()

# kelvasi_headers(NAME [LINK ...]): a folder that has headers only.
function(kelvasi_headers NAME)
  cmake_parse_arguments(ARG "" "" "LINK" ${ARGN})
  add_library(kelvasi_${NAME} INTERFACE)
  target_link_libraries(kelvasi_${NAME} INTERFACE kelvasi_options ${ARG_LINK})
endfunction()

# kelvasi_test(NAME SOURCES ... [LINK ...]): a GoogleTest program whose cases CTest runs one by one.
function(kelvasi_test NAME)
  cmake_parse_arguments(ARG "" "" "SOURCES;LINK" ${ARGN})
  add_executable(${NAME} ${ARG_SOURCES})
  target_link_libraries(${NAME} PRIVATE kelvasi_options ${ARG_LINK} GTest::gmock GTest::gtest_main)
  gtest_discover_tests(${NAME} DISCOVERY_TIMEOUT 60 PROPERTIES TIMEOUT 120)
endfunction()
