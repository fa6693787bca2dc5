// SPDX-License-Identifier: Apache-2.0
// Whole dB for a linear Ec/No.
#pragma once

#include <array>
#include <cstdint>

namespace kelvasi {

struct EcnoStep {
  std::uint32_t from;  // the least linear value of the step
  std::int16_t decibels;
};

// Descending; -31 stands twice and -32 never occurs.
inline constexpr std::array ecnoLadder{
    EcnoStep{524288, 0},  EcnoStep{417648, -1}, EcnoStep{331809, -2}, EcnoStep{263625, -3},
    EcnoStep{209464, -4}, EcnoStep{166442, -5}, EcnoStep{132269, -6}, EcnoStep{105124, -7},
    EcnoStep{83563, -8},  EcnoStep{66436, -9},  EcnoStep{52831, -10}, EcnoStep{42024, -11},
    EcnoStep{33441, -12}, EcnoStep{26622, -13}, EcnoStep{21206, -14}, EcnoStep{16904, -15},
    EcnoStep{13487, -16}, EcnoStep{10772, -17}, EcnoStep{8616, -18},  EcnoStep{6903, -19},
    EcnoStep{5543, -20},  EcnoStep{4462, -21},  EcnoStep{3604, -22},  EcnoStep{2922, -23},
    EcnoStep{2241, -24},  EcnoStep{1950, -25},  EcnoStep{1608, -26},  EcnoStep{1337, -27},
    EcnoStep{1121, -28},  EcnoStep{950, -29},   EcnoStep{814, -30},   EcnoStep{757, -31},
    EcnoStep{706, -31},
};

}  // namespace kelvasi
