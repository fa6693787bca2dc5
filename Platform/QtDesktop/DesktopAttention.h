// SPDX-License-Identifier: Apache-2.0
// Calls over the session bus: a notification (org.freedesktop.Notifications) with a sound's name, and the
// phone's feedback (org.sigxcpu.Feedback), which vibrates and sounds as the user's profile has it.
#pragma once

#include <QDBusMessage>
#include <QObject>
#include <QString>
#include <functional>
#include <map>
#include <string>

#include "Platform/Attention.h"

namespace kelvasi {

class DesktopAttention : public Attention {
 public:
  // `beep` makes the sound where no service on the bus does.
  explicit DesktopAttention(std::function<void()> beep) : beep_(std::move(beep)) {}

  void call(std::string_view subject, std::string_view title, std::string_view text) override;

 private:
  // One answer each; `failed` is also called where there is no such service.
  void ask(const QDBusMessage& question, std::function<void(const QDBusMessage&)> answered,
           std::function<void()> failed);
  void notify(const std::string& subject, const QString& title, const QString& text);
  void giveFeedback();
  void soundUnlessTheDesktopDoes();

  std::function<void()> beep_;
  std::map<std::string, uint> notices_;  // the desktop's numbers, by subject
  QObject context_;                      // of the answers that are awaited
};

}  // namespace kelvasi
