// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/UTRAN/UTRANLogGenerator.h"

#include <algorithm>

#include "LogGenerator/UTRAN/UTRANClassIndex.h"
#include "Platform/Resources.h"
#include "Platform/SystemLog.h"

namespace kelvasi {

namespace {

constexpr std::string_view mark = "UTRAN";

bool isMarked(std::string_view path) {
  const auto isLetter = [](char found, char wanted) {
    return (found >= 'a' && found <= 'z' ? static_cast<char>(found - 'a' + 'A') : found) == wanted;
  };
  return std::search(path.begin(), path.end(), mark.begin(), mark.end(), isLetter) != path.end();
}

std::string nameWithoutExtension(std::string_view path) {
  const std::string_view file = path.substr(path.rfind('/') + 1);
  return std::string(file.substr(0, file.rfind('.')));
}

}  // namespace

std::unique_ptr<LogGenerator> UTRANLogGenerator::generator(const Platform& platform) {
  if (auto name = templateName(platform.resources))
    return std::make_unique<UTRANLogGenerator>(platform, *std::move(name));
  return std::make_unique<UTRANLogGenerator>(platform);
}

UTRANLogGenerator::UTRANLogGenerator(const Platform& platform, std::string templateName)
    : OrvaneLogGenerator2(platform, std::move(templateName), std::make_unique<UTRANClassIndex>(platform)) {
  platform.log.print(LogPriority::error, "Created UTRANLogGenerator object");
}

std::optional<std::string> UTRANLogGenerator::templateName(const Resources& resources) {
  const std::vector<std::string> paths = resources.pathsOfType("plist");
  const auto path = std::ranges::find_if(paths, isMarked);
  if (path == paths.end()) return std::nullopt;
  return nameWithoutExtension(*path);
}

}  // namespace kelvasi
