// SPDX-License-Identifier: Apache-2.0
#pragma once

namespace kelvasi {

inline constexpr int rowHeight = 50;  // points

}  // namespace kelvasi
