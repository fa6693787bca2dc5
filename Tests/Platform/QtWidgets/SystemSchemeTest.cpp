// SPDX-License-Identifier: Apache-2.0
// The desktop's portal on a session bus of the test's own, and what the scheme makes of its answer.
#include "Platform/QtWidgets/SystemScheme.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <QApplication>
#include <QDBusConnection>
#include <QDBusMessage>
#include <QDBusVariant>
#include <QProcess>
#include <QTest>

namespace kelvasi {
namespace {

using testing::ElementsAre;

constexpr const char* space = "org.freedesktop.appearance";
constexpr const char* key = "color-scheme";

class Portal : public QObject {
  Q_OBJECT
  Q_CLASSINFO("D-Bus Interface", "org.freedesktop.portal.Settings")

 public:
  unsigned value = 0;

 public slots:
  // Wrapped twice, as the portal's first version does.
  QDBusVariant Read(const QString& itsSpace, const QString& itsKey) const {
    EXPECT_EQ(itsSpace, space);
    EXPECT_EQ(itsKey, key);
    return QDBusVariant(QVariant::fromValue(QDBusVariant(value)));
  }
};

TEST(SystemScheme, AsksThePortalAndFollowsIt) {
  QProcess bus;
  bus.start("dbus-daemon", {"--session", "--nofork", "--nopidfile", "--print-address"});
  ASSERT_TRUE(bus.waitForStarted() && bus.waitForReadyRead()) << "there is no dbus-daemon";
  const QByteArray address = bus.readLine().trimmed();
  qputenv("DBUS_SESSION_BUS_ADDRESS", address);
  QDBusConnection desk = QDBusConnection::connectToBus(QString::fromUtf8(address), "desk");
  Portal portal;
  portal.value = 1;
  ASSERT_TRUE(
      desk.registerObject("/org/freedesktop/portal/desktop", &portal, QDBusConnection::ExportAllSlots));
  ASSERT_TRUE(desk.registerService("org.freedesktop.portal.Desktop"));
  QApplication::setPalette(paletteOf(ColourScheme::light));

  std::vector<ColourScheme> changes;
  const SystemScheme scheme([&](ColourScheme now) { changes.push_back(now); });
  EXPECT_EQ(scheme.scheme(), ColourScheme::light);
  ASSERT_TRUE(QTest::qWaitFor([&] { return changes.size() == 1; }, 60'000));
  EXPECT_THAT(changes, ElementsAre(ColourScheme::dark));

  auto changed = QDBusMessage::createSignal("/org/freedesktop/portal/desktop",
                                            "org.freedesktop.portal.Settings", "SettingChanged");
  changed << QString(space) << QString(key) << QVariant::fromValue(QDBusVariant(2U));
  ASSERT_TRUE(desk.send(changed));
  ASSERT_TRUE(QTest::qWaitFor([&] { return changes.size() == 2; }, 60'000));
  EXPECT_THAT(changes, ElementsAre(ColourScheme::dark, ColourScheme::light));
  QDBusConnection::disconnectFromBus("desk");
  bus.terminate();
  bus.waitForFinished();
}

}  // namespace
}  // namespace kelvasi

#include "SystemSchemeTest.moc"
