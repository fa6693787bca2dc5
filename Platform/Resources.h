// SPDX-License-Identifier: Apache-2.0
// Resources of the application package, and what the package says of itself.
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "Plist/PlistValue.h"

namespace kelvasi {

class Resources {
 public:
  virtual ~Resources() = default;

  // Paths of all resources of a type ("plist") in the package's root, ordered by name. A path begins within
  // the package: where that lies makes no difference.
  virtual std::vector<std::string> pathsOfType(std::string_view type) const = 0;
  // The bytes of resource `name`.`type`; nothing when there is none or it cannot be read.
  virtual std::optional<Bytes> contents(std::string_view name, std::string_view type) const = 0;
  // The package's version; nothing when it states none.
  virtual std::optional<std::string> bundleVersion() const = 0;
  // The moment of the build, as in "Jun  6 2017 22:20:30".
  virtual std::string buildTime() const = 0;
};

}  // namespace kelvasi
