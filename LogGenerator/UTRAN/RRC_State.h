// SPDX-License-Identifier: Apache-2.0
// Section "RRC Info": the state of the radio resource control.
#pragma once

#include "LogGenerator/Base.h"

namespace kelvasi {

class RRC_State : public Base {
 public:
  using Base::Base;

  Outcome updateWithData(RecordView record, LogCode logCode) override;
  std::string_view getSectionName() const override { return "RRC Info"; }
  SectionKind sectionKind() const override { return SectionKind::dictionary; }
  std::span<const LogCode> getLogCodeArray() const override;
  std::optional<std::size_t> versionAt(LogCode) const override;
  void describe(RowCatalog& catalog) const override;

 private:
  void traceDisplay(std::int64_t mode, const std::string& text) const;
};

}  // namespace kelvasi
