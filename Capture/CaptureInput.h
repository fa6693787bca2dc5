// Any number of captures, one after the other, as one run of messages. What cannot be read is told and passed
// over; the rest is read all the same.
#pragma once

#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "Capture/CaptureReader.h"
#include "Platform/PlistSerialiser.h"

namespace kelvasi {

class CaptureInput {
 public:
  // Is given each line for people as it comes up: a file's name, mostly a place in it, and what is wrong.
  using Tell = std::function<void(const std::string& line)>;

  // `paths` as openCapture() takes them. `plists` outlives the input.
  CaptureInput(std::vector<std::string> paths, const PlistSerialiser& plists, Tell tell);

  // Nothing at the end of the last capture.
  std::optional<CapturedMessage> next();
  // Whether something could not be read so far.
  bool hasFault() const { return hasFault_; }

 private:
  void endCapture();

  std::vector<std::string> paths_;
  const PlistSerialiser& plists_;
  Tell tell_;
  std::size_t nextPath_ = 0;
  std::unique_ptr<CaptureReader> capture_;
  bool hasFault_ = false;
};

}  // namespace kelvasi
