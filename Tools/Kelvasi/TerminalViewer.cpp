// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasi/TerminalViewer.h"

#include <unistd.h>

#include <cstring>
#include <filesystem>
#include <system_error>
#include <vector>

namespace kelvasi {

std::string becomeTerminalViewer(bool logsToStderr) {
  std::error_code unknown;
  const auto own = std::filesystem::read_symlink("/proc/self/exe", unknown);
  std::string program = (own.parent_path() / "kelvasictl").native();
  std::vector<std::string> words{program, "top"};
  if (logsToStderr) words.emplace_back("--log-stderr");
  std::vector<char*> arguments;
  for (std::string& word : words) arguments.push_back(word.data());
  arguments.push_back(nullptr);
  ::execv(program.c_str(), arguments.data());
  return program + ": " + std::strerror(errno);
}

}  // namespace kelvasi
