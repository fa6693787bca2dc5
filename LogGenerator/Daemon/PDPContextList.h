// SPDX-License-Identifier: Apache-2.0
// Section "PDP Context Info": the PDP contexts as the telephony daemon lists them, whatever their keys.
#pragma once

#include "LogGenerator/Base.h"

namespace kelvasi {

class PDPContextList : public Base {
 public:
  using Base::Base;

  Outcome updateWithData(RecordView record, LogCode logCode) override;
  void describe(RowCatalog& catalog) const override;
  std::string_view getSectionName() const override { return "PDP Context Info"; }
  SectionKind sectionKind() const override { return SectionKind::list; }
  std::span<const LogCode> getLogCodeArray() const override;

 private:
  void gather(const PlistArray& contexts) const;
};

}  // namespace kelvasi
