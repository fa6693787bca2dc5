// SPDX-License-Identifier: Apache-2.0
// The application package as a directory of files.
#pragma once

#include <cstddef>
#include <filesystem>

#include "Platform/Resources.h"

namespace kelvasi {

class PackageResources : public Resources {
 public:
  static constexpr std::size_t largestFile = std::size_t{16} << 20;  // bytes; a larger one cannot be read

  explicit PackageResources(std::filesystem::path directory = standardDirectory());

  // KELVASI_RESOURCES where that is set and not empty; else the one that belongs to this program.
  static std::filesystem::path standardDirectory();
  // For programs in a directory: Resources beside them, as in a build tree, where it is there; else the one
  // of their installation, whether it is there or not.
  static std::filesystem::path directoryFor(const std::filesystem::path& programs);

  const std::filesystem::path& directory() const { return directory_; }

  std::vector<std::string> pathsOfType(std::string_view type) const override;
  // Names and types with a slash or a NUL, empty ones and names that begin with a dot name no resource.
  std::optional<Bytes> contents(std::string_view name, std::string_view type) const override;
  std::optional<std::string> bundleVersion() const override;
  std::string buildTime() const override;

 private:
  std::filesystem::path directory_;
};

}  // namespace kelvasi
