// SPDX-License-Identifier: Apache-2.0
// A pcap or pcapng file with link type DLT_USER0: one log-channel message per packet.
#pragma once

#include <memory>

#include "Capture/CaptureReader.h"
#include "Capture/InputBytes.h"

struct pcap;
struct pcap_pkthdr;

namespace kelvasi {

class PcapReader : public CaptureReader {
 public:
  explicit PcapReader(std::unique_ptr<InputBytes> input);

  // A packet of which the capture holds only the beginning is skipped.
  std::optional<CapturedMessage> next() override;
  std::uint64_t filePosition() const override { return input_->filePosition(); }

 private:
  struct Close {
    void operator()(pcap* capture) const;
  };

  void open();
  std::uint64_t position() const;
  void skipCut(std::uint64_t offset, const pcap_pkthdr& packet);
  void fail(std::uint64_t offset, std::string reason);

  std::unique_ptr<InputBytes> input_;
  std::unique_ptr<pcap, Close> capture_;  // reads from the input; null after a fault
  std::uint64_t packetCount_ = 0;
};

}  // namespace kelvasi
