// SPDX-License-Identifier: Apache-2.0
// A name of the runtime directory and the connections to it.
#pragma once

#include <functional>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "Platform/Qt/FrameChannel.h"
#include "Platform/Qt/ListeningSocket.h"

namespace kelvasi {

// Destroying it closes the name and all connections; every handler may do so.
class FrameServer {
 public:
  // More connections than these are closed at once, each with an error line.
  static constexpr std::size_t connectionLimit = 64;
  // When the connections hold more bytes than these together, the one that holds most is closed, with an
  // error line.
  static constexpr std::size_t heldLimit = std::size_t{64} << 20;

  // False when the frame has no place on this server. The channel lasts for the call, though it may be closed
  // within it.
  using FrameHandler = std::function<bool(FrameChannel& from, const Frame& frame)>;
  using DesertionHandler = std::function<void()>;

  // Null, and one error line, when the name cannot be had.
  static std::unique_ptr<FrameServer> open(std::string_view name, SystemLog& log, FrameHandler onFrame);
  ~FrameServer();
  FrameServer(const FrameServer&) = delete;
  FrameServer& operator=(const FrameServer&) = delete;

  // Called from the event loop when the last connection on which a frame had come has ended.
  void setDesertionHandler(DesertionHandler handler) { onDesertion_ = std::move(handler); }

  void postToAll(const FrameHeader& header, std::span<const std::uint8_t> data);

 private:
  FrameServer(std::string_view name, SystemLog& log, FrameHandler onFrame);
  void add(FileDescriptor socket);
  void remove(const FrameChannel& ended);
  void boundHeld();

  std::string name_;
  SystemLog& log_;
  std::shared_ptr<const FrameHandler> onFrame_;
  DesertionHandler onDesertion_;
  std::unique_ptr<ListeningSocket> listener_;
  std::vector<std::shared_ptr<FrameChannel>> channels_;
};

}  // namespace kelvasi
