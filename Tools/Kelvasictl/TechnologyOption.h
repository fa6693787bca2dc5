// SPDX-License-Identifier: Apache-2.0
// The option --technology of the verbs that read captures.
#pragma once

#include <string>

#include "Tools/OptionSet.h"

namespace kelvasi {

// `technology` becomes an identifier, and stays as it is where the option is not given.
void addTechnology(OptionSet verb, std::string& technology, const std::string& help);
// For a verb that finds the technology of a capture itself.
void addTechnology(OptionSet verb, std::string& technology);

}  // namespace kelvasi
