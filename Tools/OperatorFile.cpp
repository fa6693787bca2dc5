// SPDX-License-Identifier: Apache-2.0
#include "Tools/OperatorFile.h"

#include <system_error>

#include "Platform/Posix/ConfigPath.h"
#include "Platform/Posix/Files.h"

namespace kelvasi {

namespace {

constexpr std::size_t largestFile = std::size_t{1} << 20;

}  // namespace

LoadedOperators loadOperators() {
  LoadedOperators loaded;
  const auto path = configPath("operators.csv");
  std::error_code unreadable;
  if (!path || !std::filesystem::exists(*path, unreadable)) return loaded;
  const FileContents file = readFile(path->native(), largestFile);
  if (file.error) loaded.complaints.push_back(*file.error);
  const std::string text(file.bytes.begin(), file.bytes.end());
  for (const Operators::Fault& fault : loaded.operators.addNames(text))
    loaded.complaints.push_back(path->native() + ": line " + std::to_string(fault.line) + " " + fault.what);
  return loaded;
}

}  // namespace kelvasi
