// SPDX-License-Identifier: Apache-2.0
// The base of all record decoders. A decoder names its section, lists the log codes that it wants, and writes
// rows into its section's container inside the display dictionary. It keeps no copy of a record.
//
// A dictionary section is written by setting keys; an array section only through replaceArrayWith or
// clearElementsInArray, so that whoever walks it under the array lock never sees it half filled.
#pragma once

#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <string_view>

#include "LogGenerator/Intake.h"
#include "LogGenerator/LogCode.h"
#include "LogGenerator/RecordView.h"
#include "LogGenerator/RowCatalog.h"
#include "LogGenerator/RowWriter.h"
#include "Platform/Platform.h"
#include "Platform/SystemLog.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

class ClassDictionary;
class CodeDictionary;

// What a section is in the display: rows by name, or a list.
enum class SectionKind { dictionary, list };

class Base {
 public:
  explicit Base(const Platform& platform) : platform_(platform) {}
  virtual ~Base() = default;
  Base(const Base&) = delete;
  Base& operator=(const Base&) = delete;

  // Registers the decoder under its section name and under each of its log codes. Both dictionaries refer to
  // it and must not outlive it.
  void initWithDictCodeDict(ClassDictionary& classDict, CodeDictionary& codeDict);
  void updateLogCodeDict(CodeDictionary& codeDict);

  // The container that the decoder writes into from now on: a dictionary or an array, shared with the
  // display.
  void updateSectionRef(PlistValue container);
  // The same without a line in the system log: for a display that is shown already.
  void moveToSection(PlistValue container) { sectionRef_ = std::move(container); }
  // Where that container stands in the display: its JSON pointer, which the decoder's readings begin with.
  void setSectionPath(std::string path);
  // Null: nobody listens.
  void gatherInto(Readings* readings) { readings_ = readings; }

  // Abstract: on Base itself each throws UnimplementedMethodError.
  virtual Outcome updateWithData(RecordView record, LogCode logCode);
  virtual std::string_view getSectionName() const;
  virtual SectionKind sectionKind() const;
  virtual std::span<const LogCode> getLogCodeArray() const;

  // The byte that says which version of this record it is; nothing where the record has none.
  virtual std::optional<std::size_t> versionAt(LogCode) const { return std::nullopt; }
  // Every row that the decoder can write.
  virtual void describe(RowCatalog&) const {}
  // What the cells of the section are to the handset.
  virtual CellRole role() const { return CellRole::none; }

  static void clearElementsInArray(PlistArray& array);
  static void replaceArrayWith(PlistArray& target, const PlistArray& source);

  // Whole dB for a linear Ec/No, 524288 being 0 dB; 0 for values of 705 and below.
  static std::int16_t lookUpECNO(std::uint32_t linear);

 protected:
  SystemLog& log() const { return platform_.log; }
  const Platform& platform() const { return platform_; }
  const PlistValue& sectionRef() const { return sectionRef_; }
  // Null when the section is of the other kind, or not bound to a display yet: then there is nowhere to
  // write.
  PlistDictionary* sectionRows() const { return sectionRef_.dictionary(); }
  PlistArray* sectionList() const { return sectionRef_.array(); }
  // What becomes of a record that is as it should be.
  Outcome rowsOutcome() const { return sectionRows() ? Outcome::shown : Outcome::sectionMissing; }
  Outcome listOutcome() const { return sectionList() ? Outcome::shown : Outcome::sectionMissing; }
  // Where readings go; null when nobody listens, or there is no section that they could stand in.
  Readings* readings() const { return sectionRef_.isAbsent() ? nullptr : readings_; }
  ReadingPlace place() const { return {.readings = readings(), .section = &section_}; }

  void trace(std::string_view text, LogPriority priority = LogPriority::warning) const;
  void logUnknownMessage(LogCode logCode) const;

 private:
  Platform platform_;
  PlistValue sectionRef_;
  ReadingSection section_;
  Readings* readings_ = nullptr;
};

}  // namespace kelvasi
