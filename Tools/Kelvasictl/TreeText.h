// SPDX-License-Identifier: Apache-2.0
// A display tree as text: a line for each node, a branch ahead of its children, the root first; the node's
// path, a tab and its value, which for a branch is empty. In both, a backslash is "\\", a tab "\t", a line
// feed "\n", a carriage return "\r" and any other control character of ASCII "\x1b" and so on, so that a line
// is a node and nothing from outside steers a terminal.
#pragma once

#include <string>

#include "Model/KelvasiModelNode.h"

namespace kelvasi {

std::string treeText(const KelvasiModelNode& root);

// The tree that the viewer would show of this display.
std::string treeText(const PlistValue& display);

}  // namespace kelvasi
