// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtDesktop/QtDateFormatters.h"

#include <QDateTime>
#include <QLocale>
#include <cmath>

namespace kelvasi {

namespace {

// Qt's patterns agree with the Unicode ones in quoted literals, yyyy, MM, dd, HH, mm and ss.
class QtDateFormatter : public DateFormatter {
 public:
  explicit QtDateFormatter(std::string_view pattern)
      : pattern_(QString::fromUtf8(pattern.data(), static_cast<qsizetype>(pattern.size()))) {}

  std::string stringFromDate(PlistDate date) const override {
    const auto seconds = static_cast<qint64>(std::floor(date.secondsSince1970));
    return QLocale().toString(QDateTime::fromSecsSinceEpoch(seconds), pattern_).toStdString();
  }

 private:
  QString pattern_;
};

}  // namespace

std::unique_ptr<DateFormatter> QtDateFormatters::makeDateFormatter(std::string_view pattern) const {
  return std::make_unique<QtDateFormatter>(pattern);
}

}  // namespace kelvasi
