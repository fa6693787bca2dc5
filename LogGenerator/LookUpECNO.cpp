// SPDX-License-Identifier: Apache-2.0
#include <algorithm>
#include <array>

#include "LogGenerator/Base.h"

namespace kelvasi {

namespace {

struct Step {
  std::uint32_t from;  // the least linear value of the step
  std::int16_t decibels;
};

// Descending; -31 stands twice and -32 never occurs.
constexpr std::array ladder{
    Step{524288, 0},  Step{417648, -1}, Step{331809, -2}, Step{263625, -3}, Step{209464, -4},
    Step{166442, -5}, Step{132269, -6}, Step{105124, -7}, Step{83563, -8},  Step{66436, -9},
    Step{52831, -10}, Step{42024, -11}, Step{33441, -12}, Step{26622, -13}, Step{21206, -14},
    Step{16904, -15}, Step{13487, -16}, Step{10772, -17}, Step{8616, -18},  Step{6903, -19},
    Step{5543, -20},  Step{4462, -21},  Step{3604, -22},  Step{2922, -23},  Step{2241, -24},
    Step{1950, -25},  Step{1608, -26},  Step{1337, -27},  Step{1121, -28},  Step{950, -29},
    Step{814, -30},   Step{757, -31},   Step{706, -31},
};

}  // namespace

std::int16_t Base::lookUpECNO(std::uint32_t linear) {
  const auto step =
      std::ranges::find_if(ladder, [&](const Step& candidate) { return linear >= candidate.from; });
  return step == ladder.end() ? std::int16_t{0} : step->decibels;
}

}  // namespace kelvasi
