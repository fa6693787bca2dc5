// SPDX-License-Identifier: Apache-2.0
// libpcap's bare loop over a capture: what any program that reads one takes at least.
#include <pcap/pcap.h>

#include <cstdint>
#include <cstdio>
#include <cstdlib>

int main(int count, char** arguments) {
  char error[PCAP_ERRBUF_SIZE] = {};
  pcap_t* capture = count == 2 ? pcap_open_offline(arguments[1], error) : nullptr;
  if (!capture) {
    std::fprintf(stderr, "usage: %s CAPTURE %s\n", arguments[0], error);
    return EXIT_FAILURE;
  }
  std::uint64_t messages = 0;
  std::uint64_t sum = 0;
  pcap_pkthdr* header = nullptr;
  const u_char* bytes = nullptr;
  while (pcap_next_ex(capture, &header, &bytes) == 1) {
    ++messages;
    sum += header->caplen + bytes[0];
  }
  pcap_close(capture);
  std::printf("%llu %llu\n", static_cast<unsigned long long>(messages), static_cast<unsigned long long>(sum));
}
