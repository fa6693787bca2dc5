// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtDesktop/DesktopActivation.h"

#include <gtest/gtest.h>

#include <QDBusConnection>
#include <QDBusConnectionInterface>
#include <QDBusMessage>
#include <QDBusPendingReply>
#include <QTest>

#include "Tests/Platform/QtDesktop/BusOfOwn.h"

namespace kelvasi {
namespace {

using testing::busOfOwn;

class DesktopActivationTest : public ::testing::Test {
 protected:
  void SetUp() override { ASSERT_FALSE(busOfOwn().isEmpty()) << "there is no dbus-daemon"; }
  void TearDown() override { QDBusConnection::disconnectFromBus("desktop"); }

  // The name of the error, empty for none.
  QString call(const QString& member, const QVariantList& arguments) {
    QDBusMessage message = QDBusMessage::createMethodCall("org.kelvasi.Kelvasi", "/org/kelvasi/Kelvasi",
                                                          "org.freedesktop.Application", member);
    message.setArguments(arguments);
    QDBusPendingReply<> reply = desktop_.asyncCall(message);
    EXPECT_TRUE(QTest::qWaitFor([&] { return reply.isFinished(); }));
    return reply.isError() ? reply.error().name() : QString();
  }
  bool isNameTaken() { return desktop_.interface()->isServiceRegistered("org.kelvasi.Kelvasi"); }

  QDBusConnection desktop_ = QDBusConnection::connectToBus(busOfOwn(), "desktop");
  int calls_ = 0;
};

TEST_F(DesktopActivationTest, ActivateIsAnsweredAndCallsOnce) {
  const DesktopActivation activation([this] { ++calls_; });
  EXPECT_EQ(call("Activate", {QVariantMap()}), "");
  EXPECT_EQ(calls_, 1);
}

TEST_F(DesktopActivationTest, FilesAndActionsAreRefused) {
  const DesktopActivation activation([this] { ++calls_; });
  EXPECT_EQ(call("Open", {QStringList("file:///drive.pcap"), QVariantMap()}),
            "org.freedesktop.DBus.Error.UnknownMethod");
  EXPECT_EQ(call("Activate", {QString("no dictionary")}), "org.freedesktop.DBus.Error.UnknownMethod");
  EXPECT_EQ(calls_, 0);
}

TEST_F(DesktopActivationTest, TheNameIsGivenBack) {
  {
    const DesktopActivation activation([] {});
    EXPECT_TRUE(isNameTaken());
  }
  EXPECT_FALSE(isNameTaken());
}

}  // namespace
}  // namespace kelvasi
