// SPDX-License-Identifier: Apache-2.0
#include "Capture/PcapWriter.h"

#include <pcap/pcap.h>

#include <algorithm>
#include <new>

namespace kelvasi {

namespace {

ssize_t appendCookie(void* cookie, const char* block, std::size_t size) {
  Bytes& bytes = *static_cast<Bytes*>(cookie);
  bytes.insert(bytes.end(), block, block + size);
  return static_cast<ssize_t>(size);
}

// The library formats into a stream. This one cannot fail, so what reaches the disk is ours to watch.
std::FILE* streamInto(Bytes& bytes) {
  return ::fopencookie(&bytes, "w",
                       {.read = nullptr, .write = appendCookie, .seek = nullptr, .close = nullptr});
}

pcap_pkthdr headerFor(std::size_t size, std::chrono::nanoseconds arrival) {
  using namespace std::chrono;
  const auto second = floor<seconds>(arrival);
  pcap_pkthdr header{};
  header.ts.tv_sec = static_cast<decltype(header.ts.tv_sec)>(second.count());
  header.ts.tv_usec = static_cast<decltype(header.ts.tv_usec)>(floor<microseconds>(arrival - second).count());
  header.len = static_cast<bpf_u_int32>(size);
  header.caplen = std::min(header.len, PcapWriter::largestPacket);
  return header;
}

}  // namespace

void PcapWriter::Close::operator()(pcap* format) const {
  pcap_close(format);
}

void PcapWriter::Close::operator()(pcap_dumper* packets) const {
  pcap_dump_close(packets);
}

PcapWriter::PcapWriter(const std::string& path, OutputFile::Existing existing)
    : file_(path, existing), format_(pcap_open_dead(DLT_USER0, largestPacket)) {
  std::FILE* stream = streamInto(formatted_);
  if (!format_ || !stream) throw std::bad_alloc();
  packets_.reset(pcap_dump_fopen(format_.get(), stream));  // which closes the stream when it fails
  if (!packets_) throw std::bad_alloc();
  if (appendFormatted() && !file_.hasOlder()) file_.publish();
}

bool PcapWriter::write(std::span<const std::uint8_t> message, std::chrono::nanoseconds arrival) {
  if (file_.error()) return false;
  const pcap_pkthdr header = headerFor(message.size(), arrival);
  // The library's callback signature wants it so.
  pcap_dump(reinterpret_cast<u_char*>(packets_.get()), &header, message.data());
  return appendFormatted() && file_.publish();
}

bool PcapWriter::appendFormatted() {
  pcap_dump_flush(packets_.get());
  const bool isAppended = file_.append(formatted_);
  formatted_.clear();
  return isAppended;
}

}  // namespace kelvasi
