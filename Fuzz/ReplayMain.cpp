// SPDX-License-Identifier: Apache-2.0
// Runs a fuzz entry over the files given as arguments, where libFuzzer's main is not there to do it.
#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <iterator>
#include <vector>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size);

int main(int count, char** arguments) {
  if (count < 2) {
    std::fprintf(stderr, "usage: %s FILE...\n", arguments[0]);
    return 2;
  }
  for (int number = 1; number < count; ++number) {
    std::ifstream file(arguments[number], std::ios::binary);
    if (!file) {
      std::fprintf(stderr, "%s: cannot be read\n", arguments[number]);
      return EXIT_FAILURE;
    }
    const std::vector<char> bytes(std::istreambuf_iterator<char>(file), {});
    std::printf("%s: %zu bytes\n", arguments[number], bytes.size());
    std::fflush(stdout);
    LLVMFuzzerTestOneInput(reinterpret_cast<const std::uint8_t*>(bytes.data()), bytes.size());
  }
}
