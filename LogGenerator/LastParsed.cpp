// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/LastParsed.h"

#include <algorithm>

namespace kelvasi {

namespace {

constexpr std::size_t mostKinds = 4;
constexpr std::size_t whereFirstKeysStand = 512;

// Empty where there is none.
std::string_view firstKeyOf(std::span<const std::uint8_t> bytes) {
  constexpr std::string_view begin = "<key>";
  const std::string_view text(reinterpret_cast<const char*>(bytes.data()), bytes.size());
  const std::size_t at = text.substr(0, whereFirstKeysStand).find(begin);
  if (at == std::string_view::npos) return {};
  const std::string_view key = text.substr(at + begin.size());
  return key.substr(0, key.find('<'));
}

}  // namespace

std::optional<PlistValue> LastParsed::parse(std::span<const std::uint8_t> bytes) const {
  Kind& kind = kindOf(firstKeyOf(bytes));
  if (!kind.hasParsed || !std::ranges::equal(bytes, kind.bytes)) {
    serialiser_.parseOver(kind.parsed, bytes);
    kind.bytes.assign(bytes.begin(), bytes.end());
    kind.hasParsed = true;
  }
  if (kind.parsed.isAbsent()) return std::nullopt;
  return kind.parsed;
}

// The last one stands for all that there is no room for.
LastParsed::Kind& LastParsed::kindOf(std::string_view firstKey) const {
  const auto kind = std::ranges::find(kinds_, firstKey, &Kind::firstKey);
  if (kind != kinds_.end()) return *kind;
  if (kinds_.size() < mostKinds) kinds_.emplace_back();
  kinds_.back().firstKey = firstKey;
  return kinds_.back();
}

}  // namespace kelvasi
