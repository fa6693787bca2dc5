// SPDX-License-Identifier: Apache-2.0
// Frames on their way into a socket.
#pragma once

#include <cstddef>
#include <cstdint>
#include <span>

#include "Platform/Qt/Frame.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

class SendBuffer {
 public:
  enum class Flushed { all, some, ended };

  // Puts one frame behind those that wait. `header.length` is set from `data`.
  void append(FrameHeader header, std::span<const std::uint8_t> data);
  // Takes the frame appended last back, unless some of it is already on its way. False then.
  bool withdrawLast();

  // Writes what the socket takes without waiting.
  Flushed flushTo(int socket);

  // Bytes that still wait.
  std::size_t size() const { return bytes_.size() - sent_; }

 private:
  void dropSent();

  Bytes bytes_;
  std::size_t sent_ = 0;       // of `bytes_`, from the front
  std::size_t lastFrame_ = 0;  // where it begins in `bytes_`
};

}  // namespace kelvasi
