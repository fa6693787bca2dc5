// SPDX-License-Identifier: Apache-2.0
// The pages that are lists.
#pragma once

#include <memory>
#include <string>

#include "Tools/Top/Page.h"

namespace kelvasi::top {

std::unique_ptr<Page> makeHelpPage(Host& host);
// Enter leads to an event's moment.
std::unique_ptr<Page> makeEventsPage(Host& host);
std::unique_ptr<Page> makeCellsPage(Host& host);
// All that is known of a row: its whole value, and where the cockpit knows the row, what it knows.
std::unique_ptr<Page> makeValuePage(Host& host, NodeRef row, const std::string& nodePath);
std::unique_ptr<Page> makeSearchPage(Host& host);
std::unique_ptr<Page> makeSavePage(Host& host);
std::unique_ptr<Page> makeNotePage(Host& host, std::uint64_t mark);
// The serving cell and its neighbours; of one row where there is a line for it.
std::unique_ptr<Page> makeChartPage(Host& host, std::optional<cockpit::ChartLineKey> line);

}  // namespace kelvasi::top
