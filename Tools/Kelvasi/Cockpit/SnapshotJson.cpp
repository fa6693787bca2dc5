// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasi/Cockpit/SnapshotJson.h"

#include <QJsonArray>
#include <QJsonObject>

namespace kelvasi {

QJsonValue jsonOf(const PlistValue& value) {
  if (const auto* dictionary = value.dictionary()) {
    QJsonObject object;
    for (const auto& [key, entry] : *dictionary) object.insert(QString::fromStdString(key), jsonOf(entry));
    return object;
  }
  if (const auto* array = value.array()) {
    QJsonArray list;
    for (const PlistValue& element : *array) list.append(jsonOf(element));
    return list;
  }
  if (const auto* text = value.string()) return QString::fromStdString(*text);
  if (const auto* integer = value.integer()) return static_cast<qint64>(*integer);
  if (const auto* real = value.real()) return *real;
  if (const auto* boolean = value.boolean()) return *boolean;
  return QJsonValue::Null;
}

}  // namespace kelvasi
