#include "Capture/PcapWriter.h"

#include <pcap/pcap.h>
#include <stdio_ext.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <cstdio>
#include <system_error>

namespace kelvasi {

namespace {

constexpr std::int64_t fileHeaderSize = 24;
constexpr std::int64_t packetHeaderSize = 16;

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

void PcapWriter::Close::operator()(pcap_dumper* file) const {
  pcap_dump_close(file);
}

PcapWriter::PcapWriter(const std::string& path)
    : name_(path == "-" ? "standard output" : path), format_(pcap_open_dead(DLT_USER0, largestPacket)) {
  std::FILE* stream = path == "-" ? stdout : std::fopen(path.c_str(), "wbe");
  if (stream && format_) file_.reset(pcap_dump_fopen(format_.get(), stream));
  if (!file_ || pcap_dump_flush(file_.get()) != 0) {
    fail();
  } else {
    wholeSize_ = fileHeaderSize;
  }
}

PcapWriter::~PcapWriter() = default;

bool PcapWriter::write(std::span<const std::uint8_t> message, std::chrono::nanoseconds arrival) {
  if (error_) return false;
  const pcap_pkthdr header = headerFor(message.size(), arrival);
  // The library's callback signature wants it so.
  pcap_dump(reinterpret_cast<u_char*>(file_.get()), &header, message.data());
  if (pcap_dump_flush(file_.get()) != 0) return fail();
  wholeSize_ += packetHeaderSize + std::int64_t{header.caplen};
  return true;
}

bool PcapWriter::fail() {
  error_ = name_ + ": " + std::generic_category().message(errno);
  if (file_) {
    std::FILE* stream = pcap_dump_file(file_.get());
    ::__fpurge(stream);
    // Best effort: a pipe cannot be cut.
    if (::ftruncate(::fileno(stream), wholeSize_) != 0) return false;
  }
  return false;
}

}  // namespace kelvasi
