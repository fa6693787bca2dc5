// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtDesktop/QtPreferences.h"

#include <QDBusMessage>
#include <QStandardPaths>
#include <array>

#include "Platform/QtDesktop/SessionBus.h"

namespace kelvasi {

namespace {

struct Word {
  const char* text;
  bool value;
};

constexpr std::array words{
    Word{"true", true}, Word{"false", false}, Word{"yes", true},
    Word{"no", false},  Word{"1", true},      Word{"0", false},
};

QString text(std::string_view name) {
  return QString::fromUtf8(name.data(), static_cast<qsizetype>(name.size()));
}

}  // namespace

QString QtPreferences::standardDirectory() {
  return QStandardPaths::writableLocation(QStandardPaths::GenericConfigLocation) +
         QStringLiteral("/preferences");
}

QString QtPreferences::fileOf(std::string_view domain) const {
  return directory_ + QLatin1Char('/') + text(domain) + QStringLiteral(".ini");
}

// Settings of one file share what was set in any of them and is not written yet.
std::optional<bool> QtPreferences::boolean(std::string_view domain, std::string_view key) const {
  const QString value = QSettings(fileOf(domain), QSettings::IniFormat).value(text(key)).toString();
  for (const Word& word : words) {
    if (value.compare(QLatin1String(word.text), Qt::CaseInsensitive) == 0) return word.value;
  }
  return std::nullopt;
}

void QtPreferences::setBoolean(std::string_view domain, std::string_view key, bool value) {
  const auto settings =
      unwritten_.try_emplace(std::string(domain), fileOf(domain), QSettings::IniFormat).first;
  settings->second.setValue(text(key), value);
}

void QtPreferences::flush(std::string_view domain) {
  const auto settings = unwritten_.find(domain);
  if (settings == unwritten_.end()) return;
  settings->second.sync();
  unwritten_.erase(settings);
}

void QtPreferences::postChangeNotice(std::string_view domain, std::string_view key) {
  const auto bus = sessionBus();
  if (!bus) return;
  auto notice =
      QDBusMessage::createSignal(QStringLiteral("/org/kelvasi/Preferences"),
                                 QStringLiteral("org.kelvasi.Preferences"), QStringLiteral("Changed"));
  notice << text(domain) << text(key);
  bus->send(notice);
}

}  // namespace kelvasi
