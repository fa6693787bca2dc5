// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/OrvaneLogGenerator.h"

#include <utility>

#include "Dlf/DlfFile.h"
#include "Platform/SystemLog.h"

namespace kelvasi {

PlistValue OrvaneLogGenerator::generateDlfFromState(const PlistDictionary& state) const {
  std::optional<Bytes> dlf = beginDlf(platform());
  if (!dlf) return {};
  const PlistValue history = state.get("History");
  if (!history.array()) return std::move(*dlf);
  for (const PlistValue& entry : *history.array()) {
    const PlistValue interval = entry.dictionary() ? entry.dictionary()->get("DisplayState") : PlistValue();
    if (interval.isAbsent()) continue;
    if (!interval.data()) {
      platform().log.print(LogPriority::dlf,
                           "Got wrong class writing history to DLF; aborting writing the DLF file");
      return {};
    }
    appendDlfInterval(*dlf, *interval.data());
  }
  return std::move(*dlf);
}

PlistValue OrvaneLogGenerator::getSaveContentsFromState(const PlistDictionary& state) const {
  PlistValue contents =
      state.get("History").array() ? state.get("History").shallowCopy() : PlistArray::make();
  if (const PlistValue dlf = generateDlfFromState(state)) {
    const std::string description = "DLF binary (" + std::to_string(dlf.data()->size()) + " bytes)";
    contents.array()->append(PlistDictionary::make({{"Description", description}, {"DLF", dlf}}));
  }
  return contents;
}

void OrvaneLogGenerator::appendRawMessage(std::span<const std::uint8_t> message) {
  binData_.insert(binData_.end(), message.begin(), message.end());
}

void OrvaneLogGenerator::moveRawMessagesInto(PlistDictionary& state) {
  const std::size_t size = binData_.size();
  state.set("DisplayState", std::exchange(binData_, {}));
  binData_.reserve(size);  // the next interval is likely to be as large
}

}  // namespace kelvasi
