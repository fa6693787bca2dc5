// SPDX-License-Identifier: Apache-2.0
// A capture into which one can look before one reads it, to find its technology.
#pragma once

#include <deque>
#include <memory>
#include <optional>
#include <string_view>

#include "Capture/CaptureReader.h"
#include "Capture/TechnologyCount.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

class ProbedCapture {
 public:
  // Further than so many messages or bytes nobody looks.
  static constexpr std::size_t mostMessages = 2000;
  static constexpr std::size_t mostBytes = std::size_t{4} << 20;
  // So many messages of one technology, with none of another, are enough.
  static constexpr std::uint64_t enough = 20;

  // `codes` outlives it.
  ProbedCapture(std::unique_ptr<CaptureReader> capture, const TechnologyCodes& codes);

  // The technology of most messages, as far as one has to look. Nothing where there is none, or two with as
  // many. Not to be called after next().
  std::optional<std::string_view> findTechnology();
  // As CaptureReader's.
  std::optional<CapturedMessage> next();

  const CaptureReader& reader() const { return *capture_; }
  // Over what was read so far.
  const TechnologyCount& count() const { return count_; }

 private:
  struct Held {
    Bytes bytes;
    std::chrono::nanoseconds arrival;
  };

  std::optional<CapturedMessage> read();
  bool isClear() const;

  std::unique_ptr<CaptureReader> capture_;
  TechnologyCount count_;
  std::deque<Held> ahead_;
  std::size_t aheadBytes_ = 0;
  Held current_;  // the last of those from ahead_
};

}  // namespace kelvasi
