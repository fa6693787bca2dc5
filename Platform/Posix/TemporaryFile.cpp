// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/TemporaryFile.h"

#include <array>

namespace kelvasi {

bool TemporaryFile::append(std::string_view text) {
  return file_ && std::fwrite(text.data(), 1, text.size(), file_.get()) == text.size();
}

bool TemporaryFile::giveTo(const std::function<void(std::string_view piece)>& take) {
  if (!file_ || std::fflush(file_.get()) != 0) return false;
  std::rewind(file_.get());
  std::array<char, 65536> piece;
  while (const std::size_t size = std::fread(piece.data(), 1, piece.size(), file_.get()))
    take({piece.data(), size});
  return std::ferror(file_.get()) == 0;
}

}  // namespace kelvasi
