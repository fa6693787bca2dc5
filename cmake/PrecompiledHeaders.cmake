# SPDX-License-Identifier: Apache-2.0
# Headers that are parsed once instead of in every source. A source still includes all that it needs itself.

set(KELVASI_STANDARD_HEADERS
  <algorithm> <array> <chrono> <cmath> <cstddef> <cstdint> <functional> <map> <memory> <numeric> <optional> <ranges>
  <set> <span> <string> <string_view> <tuple> <utility> <variant> <vector>)

# kelvasi_precompile(SET HEADERS ... [LINK ...]): a set of headers for targets that link the same libraries, as these
# decide on flags.
function(kelvasi_precompile SET)
  cmake_parse_arguments(ARG "" "" "HEADERS;LINK" ${ARGN})
  file(CONFIGURE OUTPUT precompiled_${SET}.cpp CONTENT "// Nothing but the headers.\n")
  add_library(kelvasi_precompiled_${SET} STATIC ${CMAKE_CURRENT_BINARY_DIR}/precompiled_${SET}.cpp)
  target_link_libraries(kelvasi_precompiled_${SET} PRIVATE kelvasi_options ${ARG_LINK})
  target_precompile_headers(kelvasi_precompiled_${SET} PRIVATE ${KELVASI_STANDARD_HEADERS} ${ARG_HEADERS})
endfunction()

# kelvasi_precompiled(TARGET SET ...): the target uses the first set that is named.
function(kelvasi_precompiled TARGET SET)
  if(KELVASI_PRECOMPILE)
    target_precompile_headers(${TARGET} REUSE_FROM kelvasi_precompiled_${SET})
    # GCC 12 does not keep, in a precompiled std::string, which of its doubts are unfounded.
    target_compile_options(${TARGET} PRIVATE
      $<$<CXX_COMPILER_ID:GNU>:-Wno-array-bounds;-Wno-stringop-overflow;-Wno-stringop-overread>)
  endif()
endfunction()

if(KELVASI_PRECOMPILE)
  find_package(Qt6 6.4 REQUIRED COMPONENTS Core Widgets)
  set(CORE_HEADERS <QCoreApplication> <QTimer>)
  set(WIDGETS_HEADERS ${CORE_HEADERS} <QApplication> <QKeyEvent> <QLabel> <QPainter> <QScrollBar> <QWidget>)
  kelvasi_precompile(standard)
  kelvasi_precompile(qt HEADERS ${CORE_HEADERS} LINK Qt6::Core)
  kelvasi_precompile(widgets HEADERS ${WIDGETS_HEADERS} LINK Qt6::Widgets)
  if(KELVASI_TESTS)
    find_package(GTest REQUIRED)
    set(TEST_HEADERS <gmock/gmock.h> <gtest/gtest.h>)
    kelvasi_precompile(test HEADERS ${TEST_HEADERS} LINK kelvasi_test_options GTest::gmock)
    kelvasi_precompile(qt_test HEADERS ${TEST_HEADERS} ${CORE_HEADERS} LINK kelvasi_test_options GTest::gmock Qt6::Core)
    kelvasi_precompile(widgets_test HEADERS ${TEST_HEADERS} ${WIDGETS_HEADERS} LINK kelvasi_test_options GTest::gmock Qt6::Widgets)
  endif()
endif()
