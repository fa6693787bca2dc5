// SPDX-License-Identifier: Apache-2.0
#include "Redaction/Replacement.h"

#include <algorithm>
#include <bit>
#include <limits>
#include <string>

#include "Plist/PlistValue.h"

namespace kelvasi {

namespace {

bool isDigit(std::uint8_t character) {
  return character >= '0' && character <= '9';
}
bool isUpper(std::uint8_t character) {
  return character >= 'A' && character <= 'Z';
}
bool isPunctuation(std::uint8_t character) {
  const bool isLower = character >= 'a' && character <= 'z';
  return character < 0x80 && !isDigit(character) && !isUpper(character) && !isLower;
}

// Numbers of as many digits in either notation.
struct SizeClass {
  std::uint64_t least = 0;
  std::uint64_t size = 1;
};

// The largest power at most `value`, and how many numbers up to the next one.
void narrow(SizeClass& numbers, std::uint64_t value, std::uint64_t base) {
  std::uint64_t power = 1;
  while (value / power >= base) power *= base;
  const std::uint64_t least = power == 1 ? 0 : power;
  constexpr auto most = std::numeric_limits<std::uint64_t>::max();
  const std::uint64_t last = power > most / base ? most : power * base - 1;
  const std::uint64_t end = std::min(numbers.least + (numbers.size - 1), last);
  numbers.least = std::max(numbers.least, least);
  numbers.size = end - numbers.least + 1;
}

SizeClass sizeClassOf(std::uint64_t value) {
  SizeClass numbers{0, std::numeric_limits<std::uint64_t>::max()};
  narrow(numbers, value, 10);
  narrow(numbers, value, 16);
  return numbers;
}

void append(Bytes& bytes, std::uint64_t number) {
  for (unsigned byte = 0; byte < 8; ++byte) bytes.push_back(static_cast<std::uint8_t>(number >> (8 * byte)));
}

Bytes seedOf(std::string_view kind) {
  Bytes seed(kind.begin(), kind.end());
  seed.push_back(0);
  return seed;
}

// A permutation of the numbers of 2 * `half` bits (a Feistel network, as in NIST SP 800-38G).
std::uint64_t permuted(const KeyedHash& hash, const Bytes& seed, std::uint64_t number, unsigned half) {
  constexpr int rounds = 8;
  const std::uint64_t mask = (std::uint64_t{1} << half) - 1;
  std::uint64_t left = number >> half;
  std::uint64_t right = number & mask;
  for (int round = 0; round < rounds; ++round) {
    Bytes bytes = seed;
    append(bytes, static_cast<std::uint64_t>(round));
    append(bytes, right);
    const auto digest = hash.of(bytes);
    std::uint64_t mixed = 0;
    for (unsigned at = 0; at < 8; ++at) mixed = mixed << 8 | digest[at];
    const std::uint64_t next = (left ^ mixed) & mask;
    left = right;
    right = next;
  }
  return left << half | right;
}

// As many bytes as are asked for, by the identity.
class Stream {
 public:
  Stream(const KeyedHash& hash, Bytes seed) : hash_(hash), seed_(std::move(seed)) {}

  std::uint8_t next() {
    if (at_ == digest_.size()) {
      Bytes bytes = seed_;
      append(bytes, block_++);
      digest_ = hash_.of(bytes);
      at_ = 0;
    }
    return digest_[at_++];
  }

 private:
  const KeyedHash& hash_;
  Bytes seed_;
  std::uint64_t block_ = 0;
  KeyedHash::Digest digest_{};
  std::size_t at_ = digest_.size();
};

std::uint8_t letterFor(std::uint8_t character, std::uint8_t random) {
  if (isDigit(character)) return static_cast<std::uint8_t>('0' + random % 10);
  return static_cast<std::uint8_t>((isUpper(character) ? 'A' : 'a') + random % 26);
}

}  // namespace

std::uint64_t Replacement::number(std::string_view kind, std::uint64_t value) const {
  if (!hash_) return 0;
  const SizeClass numbers = sizeClassOf(value);
  const auto half = static_cast<unsigned>(std::bit_width(numbers.size - 1) + 1) / 2;
  if (half == 0) return value;
  Bytes seed = seedOf(kind);
  append(seed, numbers.least);
  std::uint64_t place = value - numbers.least;
  do {
    place = permuted(*hash_, seed, place, half);
  } while (place >= numbers.size);
  return numbers.least + place;
}

// What one writes between the digits of a number does not make it another one.
void Replacement::replaceText(std::span<std::uint8_t> text) const {
  Bytes seed = seedOf("text");
  std::ranges::remove_copy_if(text, std::back_inserter(seed), isPunctuation);
  if (!hash_) {
    for (std::uint8_t& each : text) {
      if (!isPunctuation(each)) each = isDigit(each) ? '0' : 'x';
    }
    return;
  }
  Stream stream(*hash_, std::move(seed));
  for (std::uint8_t& each : text) {
    if (!isPunctuation(each)) each = letterFor(each, stream.next());
  }
}

void Replacement::replaceBytes(std::span<std::uint8_t> bytes) const {
  if (!hash_) {
    std::ranges::fill(bytes, std::uint8_t{0});
    return;
  }
  Bytes seed = seedOf("bytes");
  seed.insert(seed.end(), bytes.begin(), bytes.end());
  Stream stream(*hash_, std::move(seed));
  for (std::uint8_t& each : bytes) each = stream.next();
}

}  // namespace kelvasi
