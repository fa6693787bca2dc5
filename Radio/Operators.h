// SPDX-License-Identifier: Apache-2.0
// Who runs a network, and where: what is built in, and a user's own names over it.
#pragma once

#include <cstddef>
#include <map>
#include <string>
#include <string_view>
#include <vector>

#include "Radio/NetworkId.h"

namespace kelvasi {

class Operators {
 public:
  // Empty where nobody knows. Both last as long as the operators, or until more names are added.
  struct Names {
    std::string_view name;
    std::string_view country;  // "test" and the like for codes that no country has
  };

  struct Fault {
    std::size_t line;  // from 1
    std::string what;
  };

  // A user's names: a line each of MCC, MNC, name and, if wanted, country, as comma-separated values in
  // UTF-8. Empty lines and those that begin with # are left out. The later line wins; returns those that were
  // not understood, the others count.
  std::vector<Fault> addNames(std::string_view csv);

  // Where the number of the MNC's digits is not known, the one network of both readings that has a name; none
  // where both do.
  Names find(const NetworkId& network) const;

  // The number, always, and what is known: "262-01 Telekom (Germany)", "262-98 (Germany)", "289-67".
  std::string describe(const NetworkId& network) const;

 private:
  struct OwnNames {
    std::string name;
    std::string country;
  };

  std::string addLine(std::string_view line);
  Names findExactly(const NetworkId& network) const;
  NetworkId withDigits(const NetworkId& network) const;

  std::map<NetworkId, OwnNames> own_;
};

}  // namespace kelvasi
