// SPDX-License-Identifier: Apache-2.0
// The rows of the technologies as a document.
#pragma once

#include <span>
#include <string>

#include "LogGenerator/RowCatalog.h"

namespace kelvasi {

struct TechnologyFields {
  std::string technology;  // its short name
  RowCatalog catalog;
};

// An object: "quantities", and "rows", each with all of its members, null where it has none of one.
std::string fieldsJson(std::span<const TechnologyFields> fields);
// A page for people (Docs/fields.md).
std::string fieldsMarkdown(std::span<const TechnologyFields> fields);

}  // namespace kelvasi
