// SPDX-License-Identifier: Apache-2.0
// The SIM files that the telephony daemon read when the handset was switched on.
#pragma once

#include <optional>
#include <string_view>

#include "Platform/PlistSerialiser.h"

namespace kelvasi::sim::gsm {

// The radio technologies that the subscriber may use, and the file that names the operator's preferred
// networks with their technologies.
struct SimTechnologies {
  std::string_view names;
  std::string_view operatorsList;
};
extern const SimTechnologies gsmAndUmts;
extern const SimTechnologies gsmUmtsAndLte;

// Record 0xFF0000; nothing when the files cannot be serialised.
std::optional<Bytes> simFilesRecord(const PlistSerialiser& plists, const SimTechnologies& technologies);

}  // namespace kelvasi::sim::gsm
