// SPDX-License-Identifier: Apache-2.0
#include "Tests/Platform/QtDesktop/BusOfOwn.h"

#include <QCoreApplication>
#include <QProcess>
#include <QVariant>
#include <memory>

namespace kelvasi::testing {

namespace {

class Daemon : public QProcess {
 public:
  Daemon() {
    setObjectName("bus");
    start("dbus-daemon", {"--session", "--nofork", "--nopidfile", "--print-address"});
    if (!waitForStarted() || !waitForReadyRead()) return;
    const QByteArray address = readLine().trimmed();
    qputenv("DBUS_SESSION_BUS_ADDRESS", address);
    setProperty("address", address);
  }
  ~Daemon() override {
    terminate();
    waitForFinished();
  }
};

}  // namespace

QString busOfOwn() {
  const QObject* daemon = QCoreApplication::instance()->findChild<QObject*>("bus");
  if (!daemon) {
    auto started = std::make_unique<Daemon>();
    started->setParent(QCoreApplication::instance());  // which ends it
    daemon = started.release();
  }
  return QString::fromUtf8(daemon->property("address").toByteArray());
}

}  // namespace kelvasi::testing
