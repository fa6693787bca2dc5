// SPDX-License-Identifier: Apache-2.0
// Tests of the toolkit need an application of Qt's, without a display.
#include <gmock/gmock.h>

#include <QApplication>

#if defined(__has_feature)
#if __has_feature(address_sanitizer)
// Qt loses the recogniser of every gesture that was grabbed.
extern "C" const char* __lsan_default_suppressions();
extern "C" const char* __lsan_default_suppressions() {
  return "leak:QScroller::grabGesture\n";
}
#endif
#endif

int main(int count, char** arguments) {
  testing::InitGoogleMock(&count, arguments);
  qputenv("QT_QPA_PLATFORM", "offscreen");
  const QApplication application(count, arguments);
  return RUN_ALL_TESTS();
}
