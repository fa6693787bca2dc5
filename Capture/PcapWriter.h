// SPDX-License-Identifier: Apache-2.0
// Writes a pcap file with link type DLT_USER0, one log-channel message per packet, stamps in microseconds.
#pragma once

#include <chrono>
#include <cstdint>
#include <memory>
#include <span>
#include <string>

#include "Platform/Posix/OutputFile.h"
#include "Plist/PlistValue.h"

struct pcap;
struct pcap_dumper;

namespace kelvasi {

class PcapWriter {
 public:
  // Of a larger message only so much goes into the file, with its true size beside it: no reader takes more.
  static constexpr std::uint32_t largestPacket = 262144;

  // "-" is the standard output. A new file is a capture from the start. One that replaces another takes its
  // place with the first message, and until then there is only the other.
  PcapWriter(const std::string& path, OutputFile::Existing existing);
  PcapWriter(const PcapWriter&) = delete;
  PcapWriter& operator=(const PcapWriter&) = delete;

  // Returns when the message is in the operating system's hands: neither a signal nor a crash of this process
  // loses it. `arrival` is since 1970 UTC. False, and error() set, when it could not be written; nothing is
  // written from then on, and a file on a disk ends with the last message before it.
  bool write(std::span<const std::uint8_t> message, std::chrono::nanoseconds arrival);
  // Returns when the file is on its disk. False, and error() set, when that cannot be said.
  bool close() { return file_.close(); }

  // Whether an older file has its place until the first message.
  bool hasOlder() const { return file_.hasOlder(); }
  // One line, "FILE: REASON".
  const FileError& error() const { return file_.error(); }

 private:
  struct Close {
    void operator()(pcap* format) const;
    void operator()(pcap_dumper* packets) const;
  };

  bool appendFormatted();

  OutputFile file_;
  Bytes formatted_;  // by the library, not yet in the file
  std::unique_ptr<pcap, Close> format_;
  std::unique_ptr<pcap_dumper, Close> packets_;  // writes into `formatted_`
};

}  // namespace kelvasi
