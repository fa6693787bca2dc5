// Section "RRC Info": the state of the radio resource control.
#pragma once

#include "LogGenerator/Base.h"

namespace kelvasi {

class RRC_State : public Base {
 public:
  using Base::Base;

  void updateWithData(RecordView record, LogCode logCode) override;
  std::string_view getSectionName() const override { return "RRC Info"; }
  std::span<const LogCode> getLogCodeArray() const override;

 private:
  void traceDisplay(std::int64_t mode, std::string_view text) const;
};

}  // namespace kelvasi
