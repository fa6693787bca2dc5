// SPDX-License-Identifier: Apache-2.0
// How many messages of a run only one technology asks for, for each of them.
#pragma once

#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace kelvasi {

// Which technology asks for a message.
class TechnologyCodes {
 public:
  TechnologyCodes();

  // A place in technologyIds(): of the one technology that asks for the record's code, or takes property
  // lists. Nothing for what nobody asks for or several do, as for the telephony daemon's own records.
  std::optional<std::size_t> technologyOf(std::span<const std::uint8_t> message) const;

 private:
  std::vector<std::uint8_t> byCode_;  // 65536 places, each with that of its technology and one more, or 0
};

class TechnologyCount {
 public:
  // `codes` outlives it.
  explicit TechnologyCount(const TechnologyCodes& codes);

  void count(std::span<const std::uint8_t> message);
  std::uint64_t messages() const { return messages_; }
  std::uint64_t of(std::string_view technology) const;
  // Whether there are messages, and no technology asks for any of them.
  bool fitsNone() const { return messages_ > 0 && strangers_ == messages_; }

  // The identifiers of those that have messages, the one with most first; of equals the first in
  // technologyIds().
  std::vector<std::string_view> ranking() const;
  // For people: "Orvane_LTE (812 of 900 messages) and Orvane_UTRAN2 (3)".
  std::string text(std::span<const std::string_view> technologies) const;

 private:
  const TechnologyCodes& codes_;
  std::uint64_t messages_ = 0;
  std::uint64_t strangers_ = 0;
  std::vector<std::uint64_t> counts_;  // in the order of technologyIds()
};

}  // namespace kelvasi
