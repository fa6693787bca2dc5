// Tests of the toolkit need an application of Qt's, without a display.
#include <gmock/gmock.h>

#include <QApplication>

int main(int count, char** arguments) {
  testing::InitGoogleMock(&count, arguments);
  qputenv("QT_QPA_PLATFORM", "offscreen");
  const QApplication application(count, arguments);
  return RUN_ALL_TESTS();
}
