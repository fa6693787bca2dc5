// SPDX-License-Identifier: Apache-2.0
// For exchange_with_plistlib.py. `xml SEED FILE` and `binary SEED FILE` write a sample, `read FILE` parses a
// file; all print the value's canonical text.
#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <iterator>
#include <string>
#include <string_view>

#include "Platform/Plist/LibplistSerialiser.h"
#include "Tests/Platform/Plist/PlistSamples.h"

namespace {

using namespace kelvasi;

std::optional<PlistValue> written(std::string_view form, const std::string& seed, const char* path) {
  const PlistValue value = testing::PlistSamples(std::stoull(seed)).value();
  const LibplistSerialiser plists;
  const auto bytes = form == "xml" ? plists.serialiseXml(value) : plists.serialiseBinary(value);
  if (!bytes) return std::nullopt;
  std::ofstream(path, std::ios::binary) << testing::textOf(*bytes);
  return value;
}

std::optional<PlistValue> read(const char* path) {
  std::ifstream file(path, std::ios::binary);
  return LibplistSerialiser().parse(Bytes(std::istreambuf_iterator<char>(file), {}));
}

}  // namespace

int main(int count, char** arguments) {
  const auto value =
      count == 4 ? written(arguments[1], arguments[2], arguments[3]) : read(arguments[count - 1]);
  if (!value) return EXIT_FAILURE;
  std::puts(testing::canonical(*value).c_str());
}
