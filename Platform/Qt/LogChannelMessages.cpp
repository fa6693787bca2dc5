// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/LogChannelMessages.h"

#include <algorithm>
#include <bit>
#include <iterator>

#include "Platform/Qt/Frame.h"

namespace kelvasi {

namespace {

constexpr std::size_t domainAt = 0;
constexpr std::size_t codeAt = 4;
constexpr std::size_t nameAt = 8;

}  // namespace

Bytes encodeAnswer(const LogChannelAnswer& answer) {
  Bytes data(nameAt);
  const std::span<std::uint8_t, nameAt> numbers(data);
  putLittleEndian32(numbers.subspan<domainAt, 4>(), std::bit_cast<std::uint32_t>(answer.error.domain));
  putLittleEndian32(numbers.subspan<codeAt, 4>(), std::bit_cast<std::uint32_t>(answer.error.code));
  std::ranges::copy(answer.portName.value_or(""), std::back_inserter(data));
  return data;
}

std::optional<LogChannelAnswer> decodeAnswer(std::span<const std::uint8_t> data) {
  if (data.size() < nameAt || data.size() > nameAt + maximumPortName) return std::nullopt;
  LogChannelAnswer answer;
  answer.error.domain = std::bit_cast<std::int32_t>(littleEndian32(data.subspan<domainAt, 4>()));
  answer.error.code = std::bit_cast<std::int32_t>(littleEndian32(data.subspan<codeAt, 4>()));
  if (data.size() > nameAt) answer.portName.emplace(textOf(data.subspan(nameAt)));
  return answer;
}

std::span<const std::uint8_t> bytesOf(std::string_view text) {
  // NOLINTNEXTLINE(cppcoreguidelines-pro-type-reinterpret-cast): any bytes, seen as such
  return {reinterpret_cast<const std::uint8_t*>(text.data()), text.size()};
}

std::string_view textOf(std::span<const std::uint8_t> bytes) {
  // NOLINTNEXTLINE(cppcoreguidelines-pro-type-reinterpret-cast): likewise
  return {reinterpret_cast<const char*>(bytes.data()), bytes.size()};
}

}  // namespace kelvasi
