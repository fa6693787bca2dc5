// SPDX-License-Identifier: Apache-2.0
// Text that has to wait for its turn. What is more than a megabyte waits in a file without a name.
#pragma once

#include <functional>
#include <optional>
#include <string>
#include <string_view>

#include "Platform/Posix/TemporaryFile.h"

namespace kelvasi {

class Spool {
 public:
  // Throws ToolError when there is no room for it.
  void add(std::string_view text);
  // Hands out everything, in pieces.
  void giveTo(const std::function<void(std::string_view text)>& print);

 private:
  static constexpr std::size_t mostInMemory = std::size_t{1} << 20;

  void moveToFile();

  std::string text_;
  std::optional<TemporaryFile> file_;
};

}  // namespace kelvasi
