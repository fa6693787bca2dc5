// SPDX-License-Identifier: Apache-2.0
// One connected socket that carries frames, on the event loop or, for a bounded time, waited for.
#pragma once

#include <chrono>
#include <functional>
#include <memory>
#include <string>

#include "Platform/Posix/FileDescriptor.h"
#include "Platform/Qt/Frame.h"
#include "Platform/Qt/ReceiveBuffer.h"
#include "Platform/Qt/SendBuffer.h"

class QSocketNotifier;
class QTimer;

namespace kelvasi {

class SystemLog;

// A fault in what the peer sends closes the connection with one error line.
class FrameChannel : public std::enable_shared_from_this<FrameChannel> {
 public:
  using Deadline = std::chrono::steady_clock::time_point;
  // False when the frame has no place on this connection, which is a fault.
  using FrameHandler = std::function<bool(const Frame& frame)>;
  // The peer has gone or was closed for a fault; the channel is closed by then.
  using EndHandler = std::function<void()>;
  // The loop has read from the peer, and what was whole has been taken.
  using ReadHandler = std::function<void()>;
  enum class Outcome { done, timedOut, ended };

  // Above this many waiting bytes post() takes no more.
  static constexpr std::size_t backlogLimit = std::size_t{8} << 20;

  // `name` is what error lines call the connection. The socket is a connected, non-blocking one.
  FrameChannel(FileDescriptor socket, std::string name, SystemLog& log);
  ~FrameChannel();
  FrameChannel(const FrameChannel&) = delete;
  FrameChannel& operator=(const FrameChannel&) = delete;

  // To be called once, first. The handlers are called from the event loop, the frame handler from receiveBy()
  // too; each may close or release the channel.
  void start(FrameHandler onFrame, EndHandler onEnd, ReadHandler onRead = {});
  // What the socket takes at once still goes. No handler is called afterwards.
  void close();

  bool isOpen() const { return static_cast<bool>(socket_); }
  // Asks the socket, so that it holds without the event loop having run.
  bool isPeerThere() const;
  bool hadFault() const { return hadFault_; }
  // Whether a frame has come from the peer.
  bool hasSpoken() const { return hasSpoken_; }
  // Bytes that wait here: of frames that are not whole yet, and of those that the peer has not taken. 0 once
  // the channel is ending.
  std::size_t held() const { return hasEnded_ ? 0 : received_.size() + toSend_.size(); }

  // Puts a frame on its way without waiting, many in one write. False when it is too large, the backlog is
  // full or the peer has gone.
  bool post(const FrameHeader& header, std::span<const std::uint8_t> data);

  // Hands the frame and all before it to the socket. One that timed out is not sent, or, when a part of it
  // has gone already, is completed later.
  Outcome sendBy(Deadline deadline, const FrameHeader& header, std::span<const std::uint8_t> data);
  // Takes frames until `isDone`. Runs no event loop.
  Outcome receiveBy(Deadline deadline, const std::function<bool()>& isDone);

  // Ends the connection with an error line, once.
  void fail(const char* reason);

 private:
  void readable();
  void fill();
  void takeFrames();
  void tellEnd();
  SendBuffer::Flushed flush();
  bool canSend() const { return isOpen() && !hasEnded_ && !isSendingOver_; }

  FileDescriptor socket_;
  std::string name_;
  SystemLog& log_;
  FrameHandler onFrame_;
  EndHandler onEnd_;
  ReadHandler onRead_;
  ReceiveBuffer received_;
  SendBuffer toSend_;
  std::size_t sinceFlush_ = 0;  // bytes put up since the socket was last tried
  bool hasEnded_ = false;       // nothing more comes in; onEnd is due
  bool hadFault_ = false;
  bool hasSpoken_ = false;
  bool isSendingOver_ = false;
  std::unique_ptr<QSocketNotifier> readNotifier_;
  std::unique_ptr<QSocketNotifier> writeNotifier_;
  std::unique_ptr<QTimer> flushTimer_;
};

}  // namespace kelvasi
