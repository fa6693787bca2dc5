// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/Spool.h"

#include <array>
#include <cerrno>
#include <system_error>

#include "Tools/Kelvasictl/ToolError.h"

namespace kelvasi {

namespace {

[[noreturn]] void fail() {
  throw ToolError("temporary file: " + std::generic_category().message(errno));
}

}  // namespace

void Spool::add(std::string_view text) {
  text_ += text;
  if (text_.size() > mostInMemory) moveToFile();
}

void Spool::moveToFile() {
  if (!file_) file_.reset(std::tmpfile());
  if (!file_ || std::fwrite(text_.data(), 1, text_.size(), file_.get()) != text_.size()) fail();
  text_.clear();
}

void Spool::giveTo(const std::function<void(std::string_view text)>& print) {
  if (file_) {
    if (std::fflush(file_.get()) != 0) fail();
    std::rewind(file_.get());
    std::array<char, 65536> piece;
    while (const std::size_t size = std::fread(piece.data(), 1, piece.size(), file_.get()))
      print({piece.data(), size});
    if (std::ferror(file_.get()) != 0) fail();
    file_.reset();
  }
  print(text_);
  text_.clear();
}

}  // namespace kelvasi
