// SPDX-License-Identifier: Apache-2.0
// A file without a name, which is gone with this object.
#pragma once

#include <cstdio>
#include <functional>
#include <memory>
#include <string_view>

namespace kelvasi {

class TemporaryFile {
 public:
  // Every operation returns false, with errno set, on failure, also where no file could be made.

  bool append(std::string_view text);
  // Hands out all of it, in pieces. Nothing is appended after that.
  bool giveTo(const std::function<void(std::string_view piece)>& take);

 private:
  struct Close {
    void operator()(std::FILE* file) const { std::fclose(file); }
  };

  std::unique_ptr<std::FILE, Close> file_{std::tmpfile()};
};

}  // namespace kelvasi
