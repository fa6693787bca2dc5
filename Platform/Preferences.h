// SPDX-License-Identifier: Apache-2.0
// Preferences in named domains, kept from run to run.
#pragma once

#include <optional>
#include <string_view>

#include "Plist/PlistValue.h"

namespace kelvasi {

class Preferences {
 public:
  virtual ~Preferences() = default;

  // Nothing when the key is absent or what it holds does not read as a boolean.
  virtual std::optional<bool> boolean(std::string_view domain, std::string_view key) const = 0;
  virtual void setBoolean(std::string_view domain, std::string_view key, bool value) = 0;
  // Writes what was set in the domain to storage.
  virtual void flush(std::string_view domain) = 0;
  // Tells other programs that a key of the domain changed.
  virtual void postChangeNotice(std::string_view domain, std::string_view key) = 0;
};

}  // namespace kelvasi
