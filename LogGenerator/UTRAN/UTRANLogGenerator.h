// SPDX-License-Identifier: Apache-2.0
// The generator of the Orvane UTRAN baseband. Its template is the first property-list resource with "UTRAN",
// in any case, in its path within the package; without one the generator asks for no records and shows
// nothing.
#pragma once

#include <optional>
#include <string>

#include "LogGenerator/OrvaneLogGenerator2.h"

namespace kelvasi {

class UTRANLogGenerator : public OrvaneLogGenerator2 {
 public:
  static std::unique_ptr<LogGenerator> generator(const Platform& platform);

  explicit UTRANLogGenerator(const Platform& platform) : OrvaneLogGenerator2(platform) {}
  UTRANLogGenerator(const Platform& platform, std::string templateName);

  // Nothing when there is no such resource.
  static std::optional<std::string> templateName(const Resources& resources);
};

}  // namespace kelvasi
