// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/FrameChannel.h"

#include <poll.h>
#include <sys/socket.h>

#include <QSocketNotifier>
#include <QTimer>
#include <algorithm>

#include "Platform/SystemLog.h"

namespace kelvasi {

namespace {

using Clock = std::chrono::steady_clock;

// Small frames gather up to this many bytes, or until the loop's next turn, before they are written.
constexpr std::size_t flushThreshold = std::size_t{64} << 10;

// A wait that ends, at the latest, with the first look after the deadline, however busy the peer keeps us.
class BoundedWait {
 public:
  explicit BoundedWait(FrameChannel::Deadline deadline) : deadline_(deadline) {}

  // False when the time is over.
  bool waitFor(int socket, short events) {
    if (isLastLook_) return false;
    const auto left = std::max(deadline_ - Clock::now(), Clock::duration::zero());
    isLastLook_ = left == Clock::duration::zero();
    const auto seconds = std::chrono::duration_cast<std::chrono::seconds>(left);
    const auto rest = std::chrono::nanoseconds(left - seconds);
    const timespec limit{static_cast<time_t>(seconds.count()), static_cast<long>(rest.count())};
    pollfd wanted{socket, events, 0};
    return ::ppoll(&wanted, 1, &limit, nullptr) != 0;  // an interrupted one has come round too early only
  }

 private:
  FrameChannel::Deadline deadline_;
  bool isLastLook_ = false;
};

}  // namespace

FrameChannel::FrameChannel(FileDescriptor socket, std::string name, SystemLog& log)
    : socket_(std::move(socket)), name_(std::move(name)), log_(log) {}

FrameChannel::~FrameChannel() {
  close();
}

void FrameChannel::start(FrameHandler onFrame, EndHandler onEnd, ReadHandler onRead) {
  onFrame_ = std::move(onFrame);
  onEnd_ = std::move(onEnd);
  onRead_ = std::move(onRead);
  readNotifier_ = std::make_unique<QSocketNotifier>(socket_.number(), QSocketNotifier::Read);
  // What a handler throws ends the program here, ahead of Qt, which must not be unwound.
  // NOLINTNEXTLINE(bugprone-exception-escape)
  QObject::connect(readNotifier_.get(), &QSocketNotifier::activated, [this]() noexcept { readable(); });
  writeNotifier_ = std::make_unique<QSocketNotifier>(socket_.number(), QSocketNotifier::Write);
  writeNotifier_->setEnabled(false);
  QObject::connect(writeNotifier_.get(), &QSocketNotifier::activated, [this] { flush(); });
  flushTimer_ = std::make_unique<QTimer>();
  flushTimer_->setSingleShot(true);
  QObject::connect(flushTimer_.get(), &QTimer::timeout, [this] { flush(); });
}

void FrameChannel::close() {
  if (!isOpen()) return;
  if (canSend()) toSend_.flushTo(socket_.number());
  readNotifier_.reset();
  writeNotifier_.reset();
  flushTimer_.reset();
  socket_.close();
}

bool FrameChannel::isPeerThere() const {
  if (!canSend()) return false;
  pollfd asked{socket_.number(), POLLRDHUP, 0};
  return ::poll(&asked, 1, 0) == 0;
}

bool FrameChannel::post(const FrameHeader& header, std::span<const std::uint8_t> data) {
  if (!canSend() || data.size() > maximumFrameData) return false;
  if (toSend_.size() > backlogLimit) flush();
  if (!canSend() || toSend_.size() > backlogLimit) return false;
  toSend_.append(header, data);
  sinceFlush_ += frameHeaderSize + data.size();
  if (sinceFlush_ >= flushThreshold) {
    flush();
  } else if (!flushTimer_->isActive() && !writeNotifier_->isEnabled()) {
    flushTimer_->start(0);
  }
  return true;
}

FrameChannel::Outcome FrameChannel::sendBy(Deadline deadline, const FrameHeader& header,
                                           std::span<const std::uint8_t> data) {
  if (!canSend()) return Outcome::ended;
  toSend_.append(header, data);
  BoundedWait wait(deadline);
  SendBuffer::Flushed flushed{};
  do {
    flushed = flush();
  } while (flushed == SendBuffer::Flushed::some && wait.waitFor(socket_.number(), POLLOUT));
  if (flushed == SendBuffer::Flushed::all) return Outcome::done;
  if (flushed == SendBuffer::Flushed::ended) return Outcome::ended;
  toSend_.withdrawLast();
  return Outcome::timedOut;
}

FrameChannel::Outcome FrameChannel::receiveBy(Deadline deadline, const std::function<bool()>& isDone) {
  BoundedWait wait(deadline);
  while (!isDone()) {
    if (!isOpen() || hasEnded_) return Outcome::ended;
    if (!wait.waitFor(socket_.number(), POLLIN)) return Outcome::timedOut;
    fill();
    takeFrames();
  }
  return Outcome::done;
}

void FrameChannel::fail(const char* reason) {
  if (!isOpen() || hasEnded_) return;
  log_.print(LogPriority::error, "%s: %s; connection closed", name_.c_str(), reason);
  hasEnded_ = true;
  hadFault_ = true;
  ::shutdown(socket_.number(), SHUT_RDWR);  // which the loop notices
}

void FrameChannel::readable() {
  const auto self = shared_from_this();  // through handlers that release the channel
  fill();
  takeFrames();
  if (isOpen() && onRead_) onRead_();
  tellEnd();
}

void FrameChannel::fill() {
  if (hasEnded_ || received_.fillFrom(socket_.number()) != ReceiveBuffer::Filled::ended) return;
  if (!received_.isEmpty()) return fail("ended inside a frame");
  hasEnded_ = true;
}

void FrameChannel::takeFrames() {
  while (isOpen() && !hasEnded_) {
    const auto frame = received_.next();
    if (!frame) break;
    hasSpoken_ = true;
    if (!onFrame_(*frame)) fail("frame of a kind or size that has no place here");
  }
  if (received_.fault()) fail((std::string("frame ") + received_.fault()).c_str());
}

void FrameChannel::tellEnd() {
  if (!isOpen() || !hasEnded_) return;
  close();
  onEnd_();
}

SendBuffer::Flushed FrameChannel::flush() {
  sinceFlush_ = 0;
  const SendBuffer::Flushed flushed = toSend_.flushTo(socket_.number());
  if (flushed == SendBuffer::Flushed::ended) isSendingOver_ = true;  // what came in before is still read
  writeNotifier_->setEnabled(flushed == SendBuffer::Flushed::some);
  return flushed;
}

}  // namespace kelvasi
