// SPDX-License-Identifier: Apache-2.0
// What a socket delivered, cut into frames.
#pragma once

#include <cstddef>
#include <cstdint>
#include <memory>
#include <optional>

#include "Platform/Qt/Frame.h"

namespace kelvasi {

class ReceiveBuffer {
 public:
  enum class Filled { some, nothing, ended };

  // One read of whatever is there, as far as there is room: 256 KiB, or more while a frame is larger. Never
  // waits on a non-blocking socket. The frames taken before are gone then.
  Filled fillFrom(int socket);

  // The next whole frame; nothing when there is none yet or a fault was met.
  std::optional<Frame> next();
  // What is wrong with the frame at hand, in words; null while nothing is.
  const char* fault() const { return fault_; }
  bool isEmpty() const { return begin_ == end_; }
  // Bytes of frames that nobody has taken.
  std::size_t size() const { return end_ - begin_; }

 private:
  std::span<const std::uint8_t> waiting() const { return {bytes_.get() + begin_, end_ - begin_}; }
  void makeRoom();
  void moveTo(std::size_t capacity);

  // NOLINTNEXTLINE(*-avoid-c-arrays): a vector would clear what the socket overwrites
  std::unique_ptr<std::uint8_t[]> bytes_;
  std::size_t capacity_ = 0;
  std::size_t begin_ = 0;
  std::size_t end_ = 0;
  std::size_t wanted_ = 0;  // size of the frame at hand, header included, once it is known
  const char* fault_ = nullptr;
};

}  // namespace kelvasi
