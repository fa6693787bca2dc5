// SPDX-License-Identifier: Apache-2.0
// Any number of captures, one after the other, as one run of messages, for every verb that is not live. What
// cannot be read is told and passed over; the rest is read all the same. Memory does not grow with them.
//
//     CaptureInput input({.paths = paths, .technology = {}}, plists, tell);
//     while (const auto message = input.next()) take(*message);
//     return input.hasFault() ? 1 : 0;
#pragma once

#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "Capture/CaptureReader.h"
#include "Capture/ProbedCapture.h"
#include "Capture/TechnologyCount.h"
#include "Platform/PlistSerialiser.h"

namespace kelvasi {

struct InputMessage : CapturedMessage {
  std::string_view technology;  // an identifier, kTelvonLogChannelTechnology_...: that of its capture
};

class CaptureInput {
 public:
  struct Choice {
    std::vector<std::string> paths;         // as openCapture() takes them
    std::optional<std::string> technology;  // an identifier; otherwise that of each capture is found
  };
  // Is told now and then how many messages, and bytes of the files, were read since it was last told.
  using Advance = std::function<void(std::uint64_t messages, std::uint64_t bytes)>;
  // Is given each line for people as it comes up, without a line feed: "FILE: ...".
  using Tell = std::function<void(const std::string& line)>;

  // `plists` outlives the input. `advance` may be empty.
  //
  // Told are: what cannot be read, with the place in the file; the technology that was found, by its short
  // name, where it is another than the capture before had; a capture that fits two technologies, or another
  // than it is taken for, with the counts of messages; one that holds none. A capture of which no technology
  // can be found is passed over.
  CaptureInput(Choice choice, const PlistSerialiser& plists, Tell tell, Advance advance = {});

  // Nothing at the end of the last capture. A message's bytes last until the next call.
  std::optional<InputMessage> next();
  // From now on all captures are taken for this technology.
  void keepTechnology(std::string_view id) { choice_.technology = id; }
  // Whether something could not be read so far: the exit status is then 1.
  bool hasFault() const { return hasFault_; }

 private:
  void openNext();
  void endCapture();
  void advance();
  void findTechnology();
  void tellWhyNoneWasFound();
  void tellOfOthers();
  void tellFault(const std::string& line);
  std::string ofCapture(const std::string& text) const;

  Choice choice_;
  const PlistSerialiser& plists_;
  Tell tell_;
  Advance advance_;
  const TechnologyCodes codes_;
  std::size_t nextPath_ = 0;
  std::optional<ProbedCapture> capture_;
  std::string_view technology_;  // of the capture; empty: none was found
  std::string_view told_;        // the technology that was last told
  bool hasFault_ = false;
  std::uint64_t newMessages_ = 0;       // since the last advance
  std::uint64_t advancedPosition_ = 0;  // in the capture's file
};

}  // namespace kelvasi
