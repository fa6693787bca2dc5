// SPDX-License-Identifier: Apache-2.0
// Whatever bytes are parsed, nothing breaks; and what was parsed is written so that it reads the same again.
#include <cstddef>
#include <cstdint>
#include <cstdlib>

#include "Platform/Plist/LibplistSerialiser.h"
#include "Plist/Description.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  using namespace kelvasi;
  const LibplistSerialiser serialiser;
  const auto value = serialiser.parse({data, size});
  if (!value) return 0;
  description(*value);
  const auto first = serialiser.serialiseXml(*value);
  if (!first) return 0;  // a date XML cannot hold
  // Compared as bytes, for "not a number" never equals itself.
  const auto again = serialiser.parse(*first);
  if (!again || serialiser.serialiseXml(*again) != first) std::abort();
  return 0;
}
