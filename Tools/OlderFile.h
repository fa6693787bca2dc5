// SPDX-License-Identifier: Apache-2.0
// What --force is for.
#pragma once

#include <filesystem>
#include <string>
#include <system_error>

#include "Platform/Posix/OutputFile.h"

namespace kelvasi {

// Why a file is not written, in one line; empty when it may be.
inline std::string refusalOf(const std::string& path, bool isForced) {
  std::error_code unknown;
  if (isForced || !std::filesystem::is_regular_file(path, unknown)) return {};
  return path + ": there is such a file already; --force overwrites it";
}

inline OutputFile::Existing existing(bool isForced) {
  return isForced ? OutputFile::Existing::isReplaced : OutputFile::Existing::stays;
}

}  // namespace kelvasi
