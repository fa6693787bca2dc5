// SPDX-License-Identifier: Apache-2.0
// The notice of a change, on a session bus of the test's own.
#include <gtest/gtest.h>

#include <QDBusConnection>
#include <QTemporaryDir>
#include <QTest>

#include "Platform/QtDesktop/QtPreferences.h"
#include "Platform/QtDesktop/SessionBus.h"
#include "Tests/Platform/QtDesktop/BusOfOwn.h"

namespace kelvasi {
namespace {

using testing::busOfOwn;

class Listener : public QObject {
  Q_OBJECT

 public:
  QList<QStringList> notices;

 public slots:
  void changed(const QString& domain, const QString& key) { notices.append({domain, key}); }
};

TEST(ChangeNotice, WithoutABusNothingIsSent) {
  qunsetenv("DBUS_SESSION_BUS_ADDRESS");
  qputenv("XDG_RUNTIME_DIR", "/nowhere");
  EXPECT_FALSE(sessionBus());
  QtPreferences("/nowhere").postChangeNotice("domain", "key");
  EXPECT_FALSE(sessionBus());
}

TEST(ChangeNotice, IsASignalWithDomainAndKeyThatComesAfterTheFileWasWritten) {
  ASSERT_FALSE(busOfOwn().isEmpty()) << "there is no dbus-daemon";
  const QTemporaryDir directory;
  Listener listener;
  QDBusConnection ears = QDBusConnection::connectToBus(busOfOwn(), "ears");
  ASSERT_TRUE(ears.connect({}, "/org/kelvasi/Preferences", "org.kelvasi.Preferences", "Changed", &listener,
                           SLOT(changed(QString, QString))));
  QtPreferences preferences(directory.path());
  preferences.setBoolean("org.kelvasi.Homerail", "HomerailShowGSMRSSI", true);
  preferences.flush("org.kelvasi.Homerail");
  preferences.postChangeNotice("org.kelvasi.Homerail", "HomerailShowGSMRSSI");
  ASSERT_TRUE(QTest::qWaitFor([&] { return !listener.notices.isEmpty(); }, 60'000));
  EXPECT_EQ(listener.notices, (QList<QStringList>{{"org.kelvasi.Homerail", "HomerailShowGSMRSSI"}}));
  EXPECT_EQ(QtPreferences(directory.path()).boolean("org.kelvasi.Homerail", "HomerailShowGSMRSSI"), true);
  QDBusConnection::disconnectFromBus("ears");
}

}  // namespace
}  // namespace kelvasi

#include "ChangeNoticeTest.moc"
