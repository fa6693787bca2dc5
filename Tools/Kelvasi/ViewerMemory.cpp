// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasi/ViewerMemory.h"

#include <QSettings>
#include <QStringList>

namespace kelvasi {

namespace {

const QString sizeKey = QStringLiteral("Window/Size");
const QString fillsKey = QStringLiteral("Window/FillsScreen");
const QString branchesKey = QStringLiteral("Panes/Open");
const QString pinsKey = QStringLiteral("Cockpit/Pins");
const QString alarmsKey = QStringLiteral("Cockpit/Alarms");
const QString appearanceKey = QStringLiteral("Appearance/Scheme");
constexpr QSize smallest(240, 320);
constexpr QSize largest(16384, 16384);

std::optional<QSize> windowSize(const QSettings& settings) {
  const QSize size = settings.value(sizeKey).toSize();
  const bool isSane = size.isValid() && size.expandedTo(smallest) == size && size.boundedTo(largest) == size;
  return isSane ? std::optional(size) : std::nullopt;
}

std::optional<ColourScheme> scheme(const QString& name) {
  if (name == QLatin1String("dark")) return ColourScheme::dark;
  if (name == QLatin1String("light")) return ColourScheme::light;
  return std::nullopt;
}

std::vector<std::string> texts(const QSettings& settings, const QString& key) {
  std::vector<std::string> texts;
  for (const QString& text : settings.value(key).toStringList()) texts.push_back(text.toStdString());
  return texts;
}

QStringList listOf(const std::vector<std::string>& texts) {
  QStringList list;
  for (const std::string& text : texts) list.append(QString::fromStdString(text));
  return list;
}

}  // namespace

ViewerMemory readMemory(const std::string& file) {
  if (file.empty()) return {};
  const QSettings settings(QString::fromStdString(file), QSettings::IniFormat);
  ViewerMemory memory{.windowSize = windowSize(settings),
                      .fillsScreen = settings.value(fillsKey).toBool(),
                      .branches = {},
                      .colourScheme = scheme(settings.value(appearanceKey).toString()),
                      .pins = {},
                      .alarms = {}};
  memory.branches = texts(settings, branchesKey);
  memory.pins = texts(settings, pinsKey);
  memory.alarms = texts(settings, alarmsKey);
  return memory;
}

void writeMemory(const std::string& file, const ViewerMemory& memory) {
  if (file.empty()) return;
  QSettings settings(QString::fromStdString(file), QSettings::IniFormat);
  if (memory.windowSize) settings.setValue(sizeKey, *memory.windowSize);
  settings.setValue(fillsKey, memory.fillsScreen);
  settings.setValue(branchesKey, listOf(memory.branches));
  settings.setValue(pinsKey, listOf(memory.pins));
  settings.setValue(alarmsKey, listOf(memory.alarms));
  settings.remove(appearanceKey);
  if (memory.colourScheme)
    settings.setValue(appearanceKey, *memory.colourScheme == ColourScheme::dark ? "dark" : "light");
}

}  // namespace kelvasi
