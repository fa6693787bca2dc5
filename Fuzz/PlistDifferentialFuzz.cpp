// SPDX-License-Identifier: Apache-2.0
// What our readers accept, libplist reads as the same value.
#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string_view>

#include "Platform/Plist/LibplistSerialiser.h"
#include "Tests/Platform/Plist/LibplistOracle.h"
#include "Tests/Platform/Plist/PlistSamples.h"

namespace {

// It knows no byte order mark, no padding behind a document and no empty tag for a key.
bool isKnownToDiffer(std::string_view document) {
  constexpr std::string_view padding("\0 \t\r\n", 5);
  return document.starts_with("\xef\xbb\xbf") || padding.find(document.back()) != padding.npos ||
         document.find("<key/>") != document.npos || document.find("<key />") != document.npos;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  using namespace kelvasi;
  const auto ours = LibplistSerialiser().parse({data, size});
  if (!ours || isKnownToDiffer({reinterpret_cast<const char*>(data), size})) return 0;
  const auto theirs = testing::readWithLibplist({data, size});
  if (!theirs) return 0;  // it refuses a text of no 16-bit units, which is as good as any
  if (testing::canonical(*theirs) != testing::canonical(*ours)) std::abort();
  return 0;
}
