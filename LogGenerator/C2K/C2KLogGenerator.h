// SPDX-License-Identifier: Apache-2.0
// The generator of the Orvane CDMA2000 baseband. It has no decoder classes: the template is walked into a
// display and a lookup table, and the record parsers write by lookup name.
//
// Besides the keys of every generator the state holds "Lookup", and what the parsers keep from record to
// record: "TrafficFER", "FLDataSeqNum", "FLDataSent", "RLDataSeqNum" and "RLDataSent".
#pragma once

#include "LogGenerator/C2K/C2KSections.h"
#include "LogGenerator/C2K/PilotList.h"
#include "LogGenerator/OrvaneLogGenerator.h"
#include "Platform/SystemLog.h"

namespace kelvasi {

class C2KLogGenerator : public OrvaneLogGenerator {
 public:
  static std::unique_ptr<LogGenerator> generator(const Platform& platform);

  using OrvaneLogGenerator::OrvaneLogGenerator;

  void updateState(PlistDictionary& state, std::span<const std::uint8_t> data) override;
  void describe(RowCatalog& catalog) const override;
  PlistValue generateLogUsingState(PlistDictionary& state) override;
  PlistValue getStartCommand() const override;
  // A display is of this technology when all leaves of the state's lookup table are in it. Into another's
  // display nothing is written.
  bool ownsDisplay(const PlistDictionary& state) const override;

  // Frames a message and hands the record to its parser. A record of a known code is kept, without the
  // prefix, for the raw log, whatever its parser made of it.
  void updateFromLog(std::span<const std::uint8_t> data, const PlistDictionary& lookup,
                     PlistDictionary& state);

  // The state's display, built with its lookup table on the first call; absent when the template cannot be
  // loaded.
  static PlistValue getDisplayFromState(PlistDictionary& state, const Platform& platform);

  // Walks a template into `display`, a dictionary, with empty leaves, and into a lookup table: a name to the
  // entries ("key" and "dict") of the leaves that it fills, in the order of the walk.
  static void processTemplate(const PlistDictionary& displayTemplate, const PlistValue& display,
                              PlistDictionary& lookup, SystemLog& log);

 private:
  PlistValue seen_;  // the display last looked at
  bool isOwn_ = false;
  C2KSections sections_;
  PilotList pilots_;  // of the record at hand
};

}  // namespace kelvasi
