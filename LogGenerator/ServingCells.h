// SPDX-License-Identifier: Apache-2.0
// Which cell serves the handset, as far as the kinds of record that say so agree.
#pragma once

#include <cstdint>
#include <optional>
#include <vector>

#include "LogGenerator/LogCode.h"
#include "Radio/CellIdentity.h"

namespace kelvasi {

class ServingCells {
 public:
  struct Word {
    CellIdentity cell;
    std::optional<std::int64_t> cellId = {};  // the network's identity of the cell (3GPP TS 23.003, 4.3.1)
  };

  // What the records of this code, `source`, say last.
  void say(LogCode source, const Word& word);
  // Another cell than the serving one: who said that it serves is out of date.
  void deny(const CellIdentity& cell);
  // The serving cell of the family; none when no record says one, or when two kinds of record contradict each
  // other. What one kind leaves open another one adds.
  CellIdentity certain(RadioFamily family) const;

 private:
  struct Saying {
    LogCode source;
    Word word;
  };
  std::vector<Saying> sayings_;
};

}  // namespace kelvasi
