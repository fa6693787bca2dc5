// SPDX-License-Identifier: Apache-2.0
// A decoder that asks for no records, so that its section shows what the template holds.
#pragma once

#include "LogGenerator/StateDecoder.h"

namespace kelvasi {

class RecordlessDecoder : public StateDecoder {
 public:
  using StateDecoder::StateDecoder;

 protected:
  // No record is meant for the section, so none is unknown either.
  Outcome decodeOther(RecordView, LogCode) override { return Outcome::notAskedFor; }
};

}  // namespace kelvasi
