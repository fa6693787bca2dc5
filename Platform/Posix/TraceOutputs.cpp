// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/TraceOutputs.h"

#include <cstdio>
#include <string>

namespace kelvasi {

namespace {

void writeLineTo(std::FILE* stream, std::string_view text) {
  std::string line(text);
  line += '\n';
  std::fwrite(line.data(), 1, line.size(), stream);
  std::fflush(stream);
}

}  // namespace

void StandardOutputTrace::writeLine(std::string_view text) {
  writeLineTo(stdout, text);
}

void StandardErrorTrace::writeLine(std::string_view text) {
  writeLineTo(stderr, text);
}

}  // namespace kelvasi
