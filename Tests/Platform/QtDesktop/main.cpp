// SPDX-License-Identifier: Apache-2.0
#include <gmock/gmock.h>

#include <QCoreApplication>

int main(int count, char** arguments) {
  testing::InitGoogleMock(&count, arguments);
  const QCoreApplication application(count, arguments);
  return RUN_ALL_TESTS();
}
