// SPDX-License-Identifier: Apache-2.0
// Preferences as one INI file for each domain, and the notice of a change as a signal on the session bus;
// both are described in Docs/preferences.md.
#pragma once

#include <QSettings>
#include <QString>
#include <functional>
#include <map>
#include <string>

#include "Platform/Preferences.h"

namespace kelvasi {

class QtPreferences : public Preferences {
 public:
  // Files of this directory, which is made when the first one is written.
  explicit QtPreferences(QString directory = standardDirectory()) : directory_(std::move(directory)) {}

  // $XDG_CONFIG_HOME/preferences, else ~/.config/preferences.
  static QString standardDirectory();

  std::optional<bool> boolean(std::string_view domain, std::string_view key) const override;
  void setBoolean(std::string_view domain, std::string_view key, bool value) override;
  void flush(std::string_view domain) override;
  void postChangeNotice(std::string_view domain, std::string_view key) override;

 private:
  QString fileOf(std::string_view domain) const;

  QString directory_;
  std::map<std::string, QSettings, std::less<>> unwritten_;  // what was set, by domain
};

}  // namespace kelvasi
