// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/Fonts.h"

#include <QApplication>
#include <QFontDatabase>
#include <QFontMetricsF>
#include <algorithm>
#include <cmath>

#include "Platform/QtWidgets/TextLine.h"

namespace kelvasi {

namespace {

// Where no desktop names a font of its own, one that reads well small.
QString systemFamily() {
  const QString family = QFontDatabase::systemFont(QFontDatabase::GeneralFont).family();
  const bool isNamed = QFontDatabase::hasFamily(family);
  const QString preferred = QStringLiteral("Inter");
  return !isNamed && QFontDatabase::hasFamily(preferred) ? preferred : family;
}

constexpr const char* scaleProperty = "kelvasiTextScale";
constexpr double textSize = 15;  // of what has no font of its own

// Marks, embeddings, overrides and isolates of the bidirectional algorithm (Unicode Annex 9).
bool isBidiControl(QChar character) {
  const char16_t code = character.unicode();
  return code == 0x061C || code == 0x200E || code == 0x200F || (code >= 0x202A && code <= 0x202E) ||
         (code >= 0x2066 && code <= 0x2069);
}

bool isLineBreak(QChar character) {
  return character == QLatin1Char('\n') || character == QChar::LineSeparator ||
         character == QChar::ParagraphSeparator;
}

}  // namespace

double textScale() {
  const QVariant scale = qApp ? qApp->property(scaleProperty) : QVariant();
  return scale.isValid() ? scale.toDouble() : 1;
}

void setTextScale(double scale) {
  qApp->setProperty(scaleProperty, std::clamp(scale, 0.5, 3.0));
  QApplication::setFont(qtFont(Font::system(textSize)));
}

QFont qtFont(const Font& font) {
  static const QString system = systemFamily();
  QFont made(font.family.empty() ? system : QString::fromStdString(font.family));
  made.setPixelSize(static_cast<int>(std::lround(font.size * textScale())));
  made.setBold(font.isBold);
  return made;
}

Size sizeOfText(std::string_view text, const Font& font) {
  const QFont itsFont = qtFont(font);
  return {std::ceil(TextLine(qtText(text), itsFont).width()), std::ceil(QFontMetricsF(itsFont).height())};
}

QString qtText(std::string_view text) {
  QString shown = QString::fromUtf8(text.data(), static_cast<qsizetype>(text.size()));
  for (QChar& character : shown) {
    if (isLineBreak(character)) character = QLatin1Char(' ');
    if (isBidiControl(character)) character = QChar::ReplacementCharacter;
  }
  return shown;
}

}  // namespace kelvasi
