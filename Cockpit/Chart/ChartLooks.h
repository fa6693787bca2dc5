// SPDX-License-Identifier: Apache-2.0
// Makes pictures and tables of charts.
#pragma once

#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "Cockpit/Chart/Chart.h"
#include "Cockpit/Events/EventLine.h"
#include "Cockpit/View.h"

namespace kelvasi::cockpit {

// What a row's chart draws; nothing where it is no number.
std::optional<ChartLineKey> chartLineOf(const View& view, std::string_view path);

std::vector<ChartLineKey> chartLinesOf(const View& view, Arrival now, std::optional<LevelKind> kind,
                                       std::size_t most);

ChartPicture pictureOf(const View& view, const Chart& chart, std::span<const MarkLine> marks, Arrival now,
                       std::size_t columns);
// RFC 4180, times in UTC.
std::string csvOf(const View& view, const Chart& chart, Arrival now);

}  // namespace kelvasi::cockpit
