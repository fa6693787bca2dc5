// SPDX-License-Identifier: Apache-2.0
// Paths of rows, for people and for the panes.
#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace kelvasi::cockpit {

// The steps of an RFC 6901 pointer, unescaped.
std::vector<std::string> stepsOf(std::string_view path);
// The node of the display tree that a row is: "/UMTS/UMTS Set/0/RSCP". What orders names for the panes,
// "2;" before them, is left out.
std::string nodePathOf(std::string_view path);
// The row's own name: the last step as a pane shows it.
std::string rowNameOf(std::string_view path);
// What it stands in: "UMTS, UMTS Set"; places in lists left out.
std::string placeTextOf(std::string_view path);
// The path with every place in a list as "*", the same for all entries of it.
std::string shapeOf(std::string_view path);

}  // namespace kelvasi::cockpit
