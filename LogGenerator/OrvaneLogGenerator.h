// SPDX-License-Identifier: Apache-2.0
// The common base of the Orvane generators: gathers the raw messages of an interval and writes them as a DLF
// file.
#pragma once

#include "LogGenerator/LogGenerator.h"

namespace kelvasi {

class OrvaneLogGenerator : public LogGenerator {
 public:
  using LogGenerator::LogGenerator;

  // The history's raw messages as a DLF file. Absent, with a line in the system log, when an interval of the
  // history holds something else than raw messages.
  PlistValue generateDlfFromState(const PlistDictionary& state) const;
  // The history's entries and, where one could be made, an entry with the DLF file.
  PlistValue getSaveContentsFromState(const PlistDictionary& state) const override;

 protected:
  void appendRawMessage(std::span<const std::uint8_t> message);
  // Hands the interval's raw messages over to the state and begins an empty interval.
  void moveRawMessagesInto(PlistDictionary& state);

 private:
  Bytes binData_;
};

}  // namespace kelvasi
