// For exchange_with_plistlib.py. `write SEED FILE` writes a sample as XML, `read FILE` parses a file; both
// print the value's canonical text.
#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <iterator>
#include <string>

#include "Platform/Plist/LibplistSerialiser.h"
#include "Tests/Platform/Plist/PlistSamples.h"

namespace {

using namespace kelvasi;

std::optional<PlistValue> written(const std::string& seed, const char* path) {
  const PlistValue value = testing::PlistSamples(std::stoull(seed)).value();
  const auto bytes = LibplistSerialiser().serialiseXml(value);
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
  const auto value = count == 4 ? written(arguments[2], arguments[3]) : read(arguments[count - 1]);
  if (!value) return EXIT_FAILURE;
  std::puts(testing::canonical(*value).c_str());
}
