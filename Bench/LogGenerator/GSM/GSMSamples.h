// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "Bench/LogGenerator/Samples.h"

namespace kelvasi::bench {

std::span<const Sample> gsmSamples();

}  // namespace kelvasi::bench
