// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/QtEventLoop.h"

#include <pthread.h>
#include <sys/signalfd.h>

#include <QCoreApplication>
#include <QDeadlineTimer>
#include <QEventLoop>
#include <QSocketNotifier>
#include <QTimer>

#include "Platform/Posix/FileDescriptor.h"
#include "Platform/Qt/EndingSignals.h"

namespace kelvasi {

// The ending signals as something to read: no handler, no global.
class QtEventLoop::Signals {
 public:
  Signals() {
    ::pthread_sigmask(SIG_BLOCK, &ending_, &before_);
    source_ = FileDescriptor(::signalfd(-1, &ending_, SFD_NONBLOCK | SFD_CLOEXEC));
    if (!source_) {
      handBack();  // the signals then end the process as usual
      return;
    }
    notifier_ = std::make_unique<QSocketNotifier>(source_.number(), QSocketNotifier::Read);
    QObject::connect(notifier_.get(), &QSocketNotifier::activated, [this] { arrived(); });
  }
  ~Signals() { handBack(); }
  Signals(const Signals&) = delete;
  Signals& operator=(const Signals&) = delete;

  int last() const { return last_; }

 private:
  void arrived() {
    signalfd_siginfo info;
    if (::read(source_.number(), &info, sizeof info) != sizeof info) return;
    last_ = static_cast<int>(info.ssi_signo);
    handBack();
    QCoreApplication::quit();
  }
  void handBack() { ::pthread_sigmask(SIG_SETMASK, &before_, nullptr); }

  sigset_t ending_ = endingSignals();
  sigset_t before_;
  FileDescriptor source_;
  std::unique_ptr<QSocketNotifier> notifier_;
  int last_ = 0;
};

QtEventLoop::QtEventLoop() {
  if (!QCoreApplication::instance())
    application_ = std::make_unique<QCoreApplication>(argumentCount_, arguments_.data());
  signals_ = std::make_unique<Signals>();
}

QtEventLoop::~QtEventLoop() = default;

int QtEventLoop::run() {
  QCoreApplication::exec();
  return signals_->last();
}

int QtEventLoop::runFor(std::chrono::milliseconds duration) {
  QTimer limit;
  limit.setSingleShot(true);
  limit.setTimerType(Qt::PreciseTimer);
  QObject::connect(&limit, &QTimer::timeout, &QCoreApplication::quit);
  limit.start(duration);
  return run();
}

// NOLINTNEXTLINE(readability-convert-member-functions-to-static): of this loop, for the caller
void QtEventLoop::drain(std::chrono::milliseconds limit) {
  const QDeadlineTimer deadline(limit);
  QEventLoop turn;
  while (turn.processEvents() && !deadline.hasExpired()) {
  }
}

// NOLINTNEXTLINE(readability-convert-member-functions-to-static): of this loop, for the caller
void QtEventLoop::quit() {
  QCoreApplication::quit();
}

}  // namespace kelvasi
