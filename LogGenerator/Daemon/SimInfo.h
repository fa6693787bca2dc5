// SPDX-License-Identifier: Apache-2.0
// Section "SIM Info": elementary files of the SIM as the telephony daemon hands them over, whatever their
// kind.
#pragma once

#include "LogGenerator/Base.h"

namespace kelvasi {

class SimInfo : public Base {
 public:
  using Base::Base;

  // Throws LogCode_0xFF000020::UnknownDataException when the record carries no property list.
  Outcome updateWithData(RecordView record, LogCode logCode) override;
  std::string_view getSectionName() const override { return "SIM Info"; }
  SectionKind sectionKind() const override { return SectionKind::dictionary; }
  std::span<const LogCode> getLogCodeArray() const override;
  void describe(RowCatalog& catalog) const override;

 private:
  void show(std::string_view row, const PlistValue& value) const;
};

}  // namespace kelvasi
