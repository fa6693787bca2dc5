// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/Fonts.h"

#include <QFontDatabase>
#include <QFontMetricsF>
#include <cmath>

namespace kelvasi {

namespace {

// Where no desktop names a font of its own, one that reads well small.
QString systemFamily() {
  const QString family = QFontDatabase::systemFont(QFontDatabase::GeneralFont).family();
  const bool isNamed = QFontDatabase::hasFamily(family);
  const QString preferred = QStringLiteral("Inter");
  return !isNamed && QFontDatabase::hasFamily(preferred) ? preferred : family;
}

}  // namespace

QFont qtFont(const Font& font) {
  static const QString system = systemFamily();
  QFont made(font.family.empty() ? system : QString::fromStdString(font.family));
  made.setPixelSize(static_cast<int>(std::lround(font.size)));
  made.setBold(font.isBold);
  return made;
}

Size sizeOfText(std::string_view text, const Font& font) {
  const QFontMetricsF metrics(qtFont(font));
  return {std::ceil(metrics.horizontalAdvance(qtText(text))), std::ceil(metrics.height())};
}

QString qtText(std::string_view text) {
  return QString::fromUtf8(text.data(), static_cast<qsizetype>(text.size()));
}

}  // namespace kelvasi
