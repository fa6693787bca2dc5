// SPDX-License-Identifier: Apache-2.0
// Text that has to wait for its turn. What is more than a megabyte waits in a file without a name.
#pragma once

#include <cstdio>
#include <functional>
#include <memory>
#include <string>
#include <string_view>

namespace kelvasi {

class Spool {
 public:
  // Throws ToolError when there is no room for it.
  void add(std::string_view text);
  // Hands out everything, in pieces.
  void giveTo(const std::function<void(std::string_view text)>& print);

 private:
  struct Close {
    void operator()(std::FILE* file) const { std::fclose(file); }
  };
  static constexpr std::size_t mostInMemory = std::size_t{1} << 20;

  void moveToFile();

  std::string text_;
  std::unique_ptr<std::FILE, Close> file_;
};

}  // namespace kelvasi
