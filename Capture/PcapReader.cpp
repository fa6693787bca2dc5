// SPDX-License-Identifier: Apache-2.0
#include "Capture/PcapReader.h"

#include <pcap/pcap.h>

#include <algorithm>
#include <array>
#include <utility>

namespace kelvasi {

namespace {

// Whatever the file says, a stamp lies between 1970 and 2255, so that times can be added and subtracted.
std::chrono::nanoseconds arrivalOf(const pcap_pkthdr& header) {
  constexpr std::int64_t lastSecond = 9'000'000'000;
  const auto seconds = std::clamp<std::int64_t>(header.ts.tv_sec, 0, lastSecond);
  const auto nanoseconds = std::clamp<std::int64_t>(header.ts.tv_usec, 0, 999'999'999);
  return std::chrono::seconds(seconds) + std::chrono::nanoseconds(nanoseconds);
}

std::string wrongLinkType(int linkType) {
  const char* name = pcap_datalink_val_to_name(linkType);
  return "link type " + std::to_string(linkType) + (name ? std::string(" (") + name + ")" : "") +
         " instead of " + std::to_string(DLT_USER0) + " (USER0)";
}

// The library knows nothing of DLF files and snapshots, and does not say what it reads.
std::string whyNotOpened(const std::string& error) {
  return error == "unknown file format" ? error + "; pcap, pcapng and DLF files and snapshots are read"
                                        : error;
}

}  // namespace

void PcapReader::Close::operator()(pcap* capture) const {
  pcap_close(capture);
}

PcapReader::PcapReader(std::unique_ptr<InputBytes> input) : input_(std::move(input)) {
  fault_ = input_->fault();
  if (!fault_) open();
}

void PcapReader::open() {
  auto stream = input_->stream();
  if (!stream) return fail(0, "no memory to read it");
  std::array<char, PCAP_ERRBUF_SIZE> error{};
  capture_.reset(
      pcap_fopen_offline_with_tstamp_precision(stream.get(), PCAP_TSTAMP_PRECISION_NANO, error.data()));
  if (!capture_) return fail(0, whyNotOpened(error.data()));
  static_cast<void>(stream.release());  // the capture closes it from now on
  const int linkType = pcap_datalink(capture_.get());
  if (linkType != DLT_USER0) fail(0, wrongLinkType(linkType));
}

std::optional<CapturedMessage> PcapReader::next() {
  while (capture_) {
    const std::uint64_t begin = position();
    pcap_pkthdr* header = nullptr;
    const u_char* bytes = nullptr;
    const int outcome = pcap_next_ex(capture_.get(), &header, &bytes);
    if (outcome != 1) {
      if (outcome != PCAP_ERROR_BREAK) fail(begin, pcap_geterr(capture_.get()));
      return std::nullopt;
    }
    ++packetCount_;
    if (header->caplen >= header->len)
      return CapturedMessage{.bytes = {bytes, header->caplen}, .arrival = arrivalOf(*header)};
    skipCut(begin, *header);
  }
  return std::nullopt;
}

void PcapReader::skipCut(std::uint64_t offset, const pcap_pkthdr& packet) {
  skip({input_->name(), offset,
        "message " + std::to_string(packetCount_) + " is cut, " + std::to_string(packet.caplen) + " of " +
            std::to_string(packet.len) + " bytes are there; it is skipped"});
}

std::uint64_t PcapReader::position() const {
  return static_cast<std::uint64_t>(::ftello(pcap_file(capture_.get())));
}

void PcapReader::fail(std::uint64_t offset, std::string reason) {
  fault_ = CaptureFault{input_->name(), offset, std::move(reason)};
  if (input_->fault()) fault_ = input_->fault();  // the library does not know the true reason
  capture_.reset();
}

}  // namespace kelvasi
