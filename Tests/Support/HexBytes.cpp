// SPDX-License-Identifier: Apache-2.0
#include "Tests/Support/HexBytes.h"

#include <algorithm>
#include <charconv>
#include <stdexcept>
#include <string>

namespace kelvasi::test {

namespace {

Bytes header(LogCode logCode) {
  const auto byte = [](LogCode value) { return static_cast<std::uint8_t>(value & 0xFF); };
  const std::uint8_t logType = logCode > 0xFFFF ? 0xFF : 0x01;
  return {logType, 0, 0, byte(logCode), byte(logCode >> 8), 0, 0, 0, 0, 0, 0, 0, 0};
}

}  // namespace

Bytes hex(std::string_view digits) {
  std::string packed(digits);
  std::erase(packed, ' ');
  if (packed.size() % 2 != 0) throw std::invalid_argument("an odd number of digits");
  Bytes bytes;
  for (std::size_t at = 0; at < packed.size(); at += 2) {
    std::uint8_t byte = 0;
    const char* const end = packed.data() + at + 2;
    if (std::from_chars(packed.data() + at, end, byte, 16).ptr != end)
      throw std::invalid_argument("not a digit");
    bytes.push_back(byte);
  }
  return bytes;
}

Bytes record(LogCode logCode, std::string_view payload, std::size_t length) {
  Bytes bytes = header(logCode);
  const Bytes tail = hex(payload);
  bytes.insert(bytes.end(), tail.begin(), tail.end());
  bytes.resize(std::max(bytes.size(), length));
  return bytes;
}

Bytes textRecord(LogCode logCode, std::string_view payload) {
  Bytes bytes = header(logCode);
  bytes.insert(bytes.end(), payload.begin(), payload.end());
  return bytes;
}

}  // namespace kelvasi::test
