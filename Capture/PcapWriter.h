// Writes a pcap file with link type DLT_USER0, one log-channel message per packet, stamps in microseconds.
#pragma once

#include <chrono>
#include <cstdint>
#include <memory>
#include <optional>
#include <span>
#include <string>

struct pcap;
struct pcap_dumper;

namespace kelvasi {

class PcapWriter {
 public:
  // Of a larger message only so much goes into the file, with its true size beside it: no reader takes more.
  static constexpr std::uint32_t largestPacket = 262144;

  // Creates the file, or overwrites it; "-" is the standard output.
  explicit PcapWriter(const std::string& path);
  ~PcapWriter();
  PcapWriter(const PcapWriter&) = delete;
  PcapWriter& operator=(const PcapWriter&) = delete;

  // Returns when the message is in the operating system's hands: neither a signal nor a crash of this process
  // loses it. `arrival` is since 1970 UTC. False, and error() set, when it could not be written; nothing is
  // written from then on, and a file on a disk is cut back to its last whole message.
  bool write(std::span<const std::uint8_t> message, std::chrono::nanoseconds arrival);

  // One line, "FILE: REASON".
  const std::optional<std::string>& error() const { return error_; }

 private:
  struct Close {
    void operator()(pcap* format) const;
    void operator()(pcap_dumper* file) const;
  };

  bool fail();

  std::string name_;
  std::optional<std::string> error_;
  std::int64_t wholeSize_ = 0;  // of the file, up to its last whole message
  std::unique_ptr<pcap, Close> format_;
  std::unique_ptr<pcap_dumper, Close> file_;
};

}  // namespace kelvasi
