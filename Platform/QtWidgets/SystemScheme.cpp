// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/SystemScheme.h"

#include <QEvent>
#include <QGuiApplication>
#include <QVariant>
#include <utility>

namespace kelvasi {

namespace {

const QString space = QStringLiteral("org.freedesktop.appearance");
const QString key = QStringLiteral("color-scheme");

constexpr unsigned noPreference = 0;
constexpr unsigned prefersDark = 1;

ColourScheme schemeOfPalette() {
  constexpr int middle = 128;
  return QGuiApplication::palette().color(QPalette::Window).lightness() < middle ? ColourScheme::dark
                                                                                 : ColourScheme::light;
}

}  // namespace

SystemScheme::SystemScheme(Changed changed)
    : changed_(std::move(changed)),
      scheme_(schemeOfPalette()),
      portal_(space, key, [this](const QVariant& value) { takeFromPortal(value); }) {
  qGuiApp->installEventFilter(this);
}

void SystemScheme::takeFromPortal(const QVariant& value) {
  const unsigned preference = value.toUInt();
  isToldByPortal_ = preference != noPreference;
  if (!isToldByPortal_) return take(schemeOfPalette());
  take(preference == prefersDark ? ColourScheme::dark : ColourScheme::light);
}

bool SystemScheme::eventFilter(QObject* watched, QEvent* event) {
  if (event->type() == QEvent::ApplicationPaletteChange && !isToldByPortal_) take(schemeOfPalette());
  return QObject::eventFilter(watched, event);
}

void SystemScheme::take(ColourScheme scheme) {
  if (std::exchange(scheme_, scheme) != scheme) changed_(scheme);
}

}  // namespace kelvasi
