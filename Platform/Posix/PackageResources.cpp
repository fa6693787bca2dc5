// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/PackageResources.h"

#include <algorithm>
#include <cstdlib>
#include <system_error>

#include "Platform/Posix/BuildTime.h"
#include "Platform/Posix/Files.h"

namespace kelvasi {

namespace {

namespace fs = std::filesystem;

bool isOneName(std::string_view text) {
  return !text.empty() && text.find('/') == std::string_view::npos &&
         text.find('\0') == std::string_view::npos;
}

bool isVisible(std::string_view name) {
  return isOneName(name) && !name.starts_with('.');
}

bool isResource(const fs::directory_entry& entry, const std::string& extension) {
  std::error_code unreadable;
  return isVisible(entry.path().filename().native()) && entry.path().extension().native() == extension &&
         entry.is_regular_file(unreadable);
}

// Of the program itself, not of a link to it.
fs::path programDirectory() {
  std::error_code unreadable;
  return fs::read_symlink("/proc/self/exe", unreadable).parent_path();
}

}  // namespace

PackageResources::PackageResources(fs::path directory) : directory_(std::move(directory)) {}

fs::path PackageResources::standardDirectory() {
  const char* chosen = std::getenv("KELVASI_RESOURCES");
  return chosen && *chosen ? fs::path(chosen) : directoryFor(programDirectory());
}

fs::path PackageResources::directoryFor(const fs::path& programs) {
  std::error_code unreadable;
  const fs::path beside = programs / "Resources";
  if (fs::is_directory(beside, unreadable)) return beside;
  return (programs / KELVASI_INSTALLED_RESOURCES).lexically_normal();
}

std::vector<std::string> PackageResources::pathsOfType(std::string_view type) const {
  std::vector<std::string> paths;
  const std::string extension = "." + std::string(type);
  std::error_code failure;
  for (fs::directory_iterator entry(directory_, failure), end; !failure && entry != end;
       entry.increment(failure)) {
    if (isResource(*entry, extension)) paths.push_back(entry->path().filename().native());
  }
  std::ranges::sort(paths, {}, [](const std::string& path) { return fs::path(path).stem(); });
  return paths;
}

std::optional<Bytes> PackageResources::contents(std::string_view name, std::string_view type) const {
  if (!isVisible(name) || !isOneName(type)) return std::nullopt;
  const fs::path path = directory_ / (std::string(name) + "." + std::string(type));
  std::error_code unreadable;
  if (!fs::is_regular_file(path, unreadable)) return std::nullopt;
  FileContents read = readFile(path.native(), largestFile);
  if (read.error) return std::nullopt;
  return std::move(read.bytes);
}

std::optional<std::string> PackageResources::bundleVersion() const {
  return KELVASI_VERSION;
}

std::string PackageResources::buildTime() const {
  return compiledAt();
}

}  // namespace kelvasi
