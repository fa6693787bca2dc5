// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/QtReadWatch.h"

#include <QSocketNotifier>

namespace kelvasi {

QtReadWatch::QtReadWatch(int descriptor, Task task)
    : notifier_(std::make_unique<QSocketNotifier>(descriptor, QSocketNotifier::Read)) {
  QObject::connect(notifier_.get(), &QSocketNotifier::activated,
                   [task = std::move(task)]() noexcept { task(); });
}

QtReadWatch::~QtReadWatch() = default;

}  // namespace kelvasi
