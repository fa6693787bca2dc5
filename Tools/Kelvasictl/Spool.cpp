// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/Spool.h"

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
  if (!file_) file_.emplace();
  if (!file_->append(text_)) fail();
  text_.clear();
}

void Spool::giveTo(const std::function<void(std::string_view text)>& print) {
  if (file_ && !file_->giveTo(print)) fail();
  file_.reset();
  print(text_);
  text_.clear();
}

}  // namespace kelvasi
