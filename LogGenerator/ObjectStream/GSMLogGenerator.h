// SPDX-License-Identifier: Apache-2.0
// The generator of the IFX baseband, whose messages are property lists that already hold the whole display:
// they are parsed, simplified and shown. No template, no decoders, no DLF file.
#pragma once

#include "LogGenerator/LogGenerator.h"

namespace kelvasi {

class GSMLogGenerator : public LogGenerator {
 public:
  static std::unique_ptr<LogGenerator> generator(const Platform& platform);

  using LogGenerator::LogGenerator;

  // Replaces the display wholesale. Throws AssertionFailure when the message is no property list, or holds
  // anything but strings, dictionaries and arrays.
  void updateState(PlistDictionary& state, std::span<const std::uint8_t> data) override;
  void describe(RowCatalog& catalog) const override;
  PlistValue generateLogUsingState(PlistDictionary& state) override;
  PlistValue getStartCommand() const override;
  // A display is this technology's once it was made from a message.
  bool ownsDisplay(const PlistDictionary& state) const override;
  PlistValue getSaveContentsFromState(const PlistDictionary& state) const override;

  // A copy in which every dictionary with one entry, below the top, is replaced by that entry's value, one
  // level at each parent. Throws AssertionFailure as updateState does.
  static PlistValue processObject(const PlistValue& object);
  // The value of the only entry of a dictionary; absent for anything else.
  static PlistValue canCollapse(const PlistValue& object);
};

}  // namespace kelvasi
