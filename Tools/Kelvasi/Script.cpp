// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasi/Script.h"

#include <QCoreApplication>
#include <array>
#include <chrono>
#include <cstdio>
#include <system_error>

#include "Tools/Kelvasi/ShownWindow.h"

namespace kelvasi {

namespace {

using namespace std::chrono_literals;

constexpr auto turnTime = 10ms;
constexpr auto patience = 60s;  // for one command

}  // namespace

Script::Script(const std::string& path) {
  if (path.empty()) return;
  file_.emplace(path);
  if (file_->error()) throw std::system_error(file_->error(), path);
  more_ = std::make_unique<QSocketNotifier>(file_->descriptor(), QSocketNotifier::Read);
  QObject::connect(more_.get(), &QSocketNotifier::activated, [this] { readMore(); });
  QObject::connect(&turn_, &QTimer::timeout, [this] { advance(); });
  turn_.start(turnTime);
}

void Script::readMore() {
  std::array<std::uint8_t, 4096> buffer;
  const std::ptrdiff_t count = file_->read(buffer);
  if (count > 0) {
    unread_.append(reinterpret_cast<const char*>(buffer.data()), count);
  } else {
    isAtEnd_ = true;
    more_->setEnabled(false);
  }
}

bool Script::takeLine() {
  if (isAtEnd_ && !unread_.isEmpty() && !unread_.endsWith('\n')) unread_.append('\n');
  const qsizetype end = unread_.indexOf('\n');
  if (end < 0) {
    if (isAtEnd_) this->end();
    return false;
  }
  ++lineNumber_;
  const QString line = QString::fromUtf8(unread_.first(end)).trimmed();
  unread_.remove(0, end + 1);
  if (line.isEmpty() || line.startsWith(QLatin1Char('#'))) return takeLine();
  step_ = scriptStep(line);
  turnsLeft_ = static_cast<int>(patience / turnTime);
  if (!step_) fail("there is no such command");
  return static_cast<bool>(step_);
}

// A turn is at most one command, so that the window has painted what the one before it did.
void Script::advance() {
  if (!isWindowStill() || (!step_ && !takeLine())) return;
  const StepResult result = step_();
  if (result.isDone) {
    step_ = nullptr;
  } else if (!result.failure.empty()) {
    fail(result.failure);
  } else if (--turnsLeft_ <= 0) {
    fail("waited in vain");
  }
}

void Script::fail(const std::string& why) {
  std::fprintf(stderr, "kelvasi: line %d of the script: %s\n", lineNumber_, why.c_str());
  hasFailed_ = true;
  end();
}

void Script::end() {
  turn_.stop();
  QCoreApplication::quit();
}

}  // namespace kelvasi
