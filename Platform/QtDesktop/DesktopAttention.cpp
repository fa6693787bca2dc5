// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtDesktop/DesktopAttention.h"

#include <QDBusPendingCallWatcher>
#include <QDBusPendingReply>
#include <QStringList>
#include <QVariantMap>
#include <utility>

#include "Platform/QtDesktop/SessionBus.h"

namespace kelvasi {

namespace {

// Names of the freedesktop.org sound naming, which feedback themes use too.
const QString event = QStringLiteral("alarm-clock-elapsed");
const QString application = QStringLiteral("org.kelvasi.Kelvasi");
constexpr uchar critical = 2;  // stays until it is dismissed
constexpr int asTheServerLikes = -1;
constexpr int once = -1;

QDBusMessage toNotifications(const char* method) {
  return QDBusMessage::createMethodCall(
      QStringLiteral("org.freedesktop.Notifications"), QStringLiteral("/org/freedesktop/Notifications"),
      QStringLiteral("org.freedesktop.Notifications"), QString::fromLatin1(method));
}

QString qtText(std::string_view text) {
  return QString::fromUtf8(text.data(), static_cast<qsizetype>(text.size()));
}

}  // namespace

void DesktopAttention::call(std::string_view subject, std::string_view title, std::string_view text) {
  notify(std::string(subject), qtText(title), qtText(text));
  giveFeedback();
}

void DesktopAttention::ask(const QDBusMessage& question, std::function<void(const QDBusMessage&)> answered,
                           std::function<void()> failed) {
  const auto bus = sessionBus();
  if (!bus) return failed();
  auto* const answer = new QDBusPendingCallWatcher(bus->asyncCall(question), &context_);
  QObject::connect(answer, &QDBusPendingCallWatcher::finished, &context_,
                   [answer, answered = std::move(answered), failed = std::move(failed)] {
                     answer->deleteLater();
                     if (answer->isError()) {
                       failed();
                     } else {
                       answered(answer->reply());
                     }
                   });
}

// The text may be taken for markup.
void DesktopAttention::notify(const std::string& subject, const QString& title, const QString& text) {
  const QVariantMap hints{{QStringLiteral("urgency"), QVariant::fromValue(critical)},
                          {QStringLiteral("category"), QStringLiteral("device")},
                          {QStringLiteral("desktop-entry"), application},
                          {QStringLiteral("sound-name"), event}};
  const auto earlier = notices_.find(subject);
  QDBusMessage question = toNotifications("Notify");
  question << QStringLiteral("Kelvasi") << (earlier == notices_.end() ? 0U : earlier->second) << application
           << title << text.toHtmlEscaped() << QStringList() << hints << asTheServerLikes;
  ask(
      question,
      [this, subject](const QDBusMessage& reply) { notices_[subject] = reply.arguments().value(0).toUInt(); },
      [] {});
}

void DesktopAttention::giveFeedback() {
  QDBusMessage question = QDBusMessage::createMethodCall(
      QStringLiteral("org.sigxcpu.Feedback"), QStringLiteral("/org/sigxcpu/Feedback"),
      QStringLiteral("org.sigxcpu.Feedback"), QStringLiteral("TriggerFeedback"));
  question << application << event << QVariantMap() << once;
  ask(
      question, [](const QDBusMessage&) {}, [this] { soundUnlessTheDesktopDoes(); });
}

void DesktopAttention::soundUnlessTheDesktopDoes() {
  ask(
      toNotifications("GetCapabilities"),
      [this](const QDBusMessage& reply) {
        if (!reply.arguments().value(0).toStringList().contains(QStringLiteral("sound"))) beep_();
      },
      [this] { beep_(); });
}

}  // namespace kelvasi
