// SPDX-License-Identifier: Apache-2.0
// The template-driven generator: builds the display once from a property-list template, hands every section
// in it to the decoder of that name, and dispatches each log record to the decoders that subscribe to its
// code.
#pragma once

#include <memory>
#include <string>

#include "LogGenerator/ClassIndex.h"
#include "LogGenerator/OrvaneLogGenerator.h"
#include "LogGenerator/RecordFraming.h"

namespace kelvasi {

class OrvaneLogGenerator2 : public OrvaneLogGenerator {
 public:
  // `pListName` is the template's resource name without extension.
  OrvaneLogGenerator2(const Platform& platform, std::string pListName, std::unique_ptr<ClassIndex> cIndex);
  // One without template and decoders: it logs nothing at its creation, asks for no records and shows
  // nothing.
  explicit OrvaneLogGenerator2(const Platform& platform);
  ~OrvaneLogGenerator2() override;

  // Frames one log message and gives the record to the subscribers of its effective log code.
  void updateWithData(std::span<const std::uint8_t> data);

  void updateState(PlistDictionary& state, std::span<const std::uint8_t> data) override;
  void gatherInto(Readings* readings) override;
  void describe(RowCatalog& catalog) const override;
  PlistValue generateLogUsingState(PlistDictionary& state) override;
  PlistValue getStartCommand() const override;
  // A display is of this technology when the state's template is, by value, and the display has its shape.
  bool ownsDisplay(const PlistDictionary& state) const override;

  // A mutable copy of a template, its sections bound to their decoders. Throws std::invalid_argument when a
  // dictionary or an array holds anything but strings, dictionaries and arrays.
  PlistValue processTemplate(const PlistValue& object);
  // Complains in the system log about every element of a processed template that does not belong into one.
  void printDict(const PlistValue& object) const;
  // The state's display. The call that builds it returns nothing; every later one returns it. A display that
  // the state already held, left there by another generator, stays as it is: the decoders are bound to its
  // sections when it is of this technology, and otherwise have nowhere to write.
  PlistValue getDisplayFromState(PlistDictionary& state);

 private:
  PlistValue loadTemplate() const;
  void bindTo(const PlistDictionary& state, const PlistValue& display);
  void decode(const FramedRecord& framed);
  // As processTemplate without a path, for a part that stands at `path` in the display.
  PlistValue processTemplate(const PlistValue& object, const std::string& path);
  // Binds the decoders to the sections of a display of this template. What decoders added to it is not looked
  // into.
  void bindSections(const PlistValue& displayTemplate, const PlistValue& display, const std::string& path);

  std::string pListName_;
  std::unique_ptr<ClassIndex> cIndex_;  // null without template
  PlistValue bound_;                    // the display last seen
  bool isOwn_ = false;                  // the decoders write into it
};

}  // namespace kelvasi
