// SPDX-License-Identifier: Apache-2.0
// What a baseband that sends whole displays says of its handset: one object with everything in it.
#pragma once

#include "Plist/PlistValue.h"
#include "Simulator/Handset/World.h"

namespace kelvasi::sim::objectStream {

// Texts, dictionaries and arrays only. Which entries there are changes with the handset's state: what is not
// there now is left out, and so a dictionary may be left with one entry, or none.
PlistValue handsetObject(const gsm::World& world);

}  // namespace kelvasi::sim::objectStream
