// SPDX-License-Identifier: Apache-2.0
// Records that are made of sub-packets: a count at byte 14, then from byte 17 on one sub-packet after the
// other.
#pragma once

#include <array>
#include <optional>

#include "LogGenerator/RecordLayout.h"
#include "Platform/SystemLog.h"

namespace kelvasi::subPackets {

inline constexpr std::size_t minimumLength = 17;
inline constexpr std::size_t first = 17;

inline constexpr std::array layout{Field{.name = "count", .byte = 14}};

// What every sub-packet starts with; the size counts the whole of it.
inline constexpr std::array headerLayout{
    Field{.name = "id", .byte = 0},
    Field{.name = "size", .byte = 2, .width = 16},
};
static_assert(inWireOrder(headerLayout));

// The first sub-packet of this id, open to the end of the record. Nothing when there is none, or when one
// before it, or itself, claims to end past the record: the search then stops with a line in the system log.
std::optional<RecordView> find(RecordView record, std::int64_t id, SystemLog& log);

}  // namespace kelvasi::subPackets
