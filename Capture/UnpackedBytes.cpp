// SPDX-License-Identifier: Apache-2.0
#include "Capture/UnpackedBytes.h"

#include <utility>

namespace kelvasi {

namespace {
constexpr std::size_t bufferSize = 1 << 16;
}

UnpackedBytes::UnpackedBytes(ByteSource& packed, std::string name, std::unique_ptr<Unpacker> unpacker)
    : packed_(packed), name_(std::move(name)), unpacker_(std::move(unpacker)), buffer_(bufferSize) {}

std::ptrdiff_t UnpackedBytes::read(std::span<std::uint8_t> block) {
  while (!fault_) {
    if (waiting_.empty() && !isAtEnd_ && !fill()) break;
    if (waiting_.empty() && isComplete_) return 0;
    const Unpacker::Step step = unpacker_->unpack(waiting_, block);
    waiting_ = waiting_.subspan(step.taken);
    taken_ += step.taken;
    isComplete_ = step.isComplete;
    if (step.given > 0) return static_cast<std::ptrdiff_t>(step.given);
    if (!step.fault.empty())
      return fail("damaged " + std::string(unpacker_->name()) + " data: " + step.fault);
    if (waiting_.empty() && isAtEnd_ && step.taken == 0 && !isComplete_)
      return fail("the " + std::string(unpacker_->name()) + " data end too early");
  }
  return -1;
}

// False after a fault of the packed bytes.
bool UnpackedBytes::fill() {
  const std::ptrdiff_t count = packed_.read(buffer_);
  if (count < 0) fault_ = packed_.fault();
  isAtEnd_ = count <= 0;
  if (count > 0) waiting_ = std::span(buffer_).first(static_cast<std::size_t>(count));
  return count >= 0;
}

std::ptrdiff_t UnpackedBytes::fail(std::string reason) {
  fault_ = CaptureFault{name_, taken_, std::move(reason)};
  return -1;
}

}  // namespace kelvasi
