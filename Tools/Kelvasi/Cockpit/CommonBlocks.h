// SPDX-License-Identifier: Apache-2.0
// Blocks that several pages are made of.
#pragma once

#include <string>

#include "Cockpit/Events/EventLine.h"
#include "Tools/Kelvasi/Cockpit/Block.h"

namespace kelvasi {

// A name with a value at the right edge, each with a smaller text below it where there is one.
struct RowWords {
  std::string name;
  std::string below = {};
  std::string value = {};
  std::string valueBelow = {};
  cockpit::Fade fade = cockpit::Fade::none;
};

// The value goes below the name where both do not fit beside each other.
Block rowBlock(const RowWords& words, double width);
// The head of a group, and perhaps of its last column.
Block captionBlock(const std::string& words, double width, const std::string& atEnd = {});
// In the place of what there is not.
Block emptyBlock(const std::string& words, double width);
// Leads elsewhere.
Block linkBlock(const std::string& words, double width);
Block bannerBlock(const std::string& words, double width);
Block eventBlock(const cockpit::EventLine& event, double width);
// As many lines as it takes.
Block wordsBlock(const std::string& words, double width);

}  // namespace kelvasi
