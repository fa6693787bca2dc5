// SPDX-License-Identifier: Apache-2.0
// An application at the other end of a log channel: what it asks is the test's to say, and what it received
// can be looked at.
#pragma once

#include <string>
#include <vector>

#include "Platform/Plist/LibplistSerialiser.h"
#include "Simulator/Message.h"
#include "Tests/Support/FakePorts.h"
#include "Tests/Support/TestPlatform.h"

namespace kelvasi::sim::test {

using kelvasi::test::FakeMainQueue;
using kelvasi::test::FakePorts;

class FakeApplication {
 public:
  struct Received {
    MessageId id;
    Bytes bytes;
  };

  FakeApplication(FakePorts& ports, std::string itsName)
      : name(std::move(itsName)),
        ports_(ports),
        port_(ports.createLocalPort(name, [this](MessageId id, std::span<const std::uint8_t> data) {
          received.push_back({id, Bytes(data.begin(), data.end())});
          return std::nullopt;
        })) {}

  // Uses the channel that the daemon opened for it.
  void use(const LogChannelAnswer& answer) {
    answered = answer;
    if (answer.portName) daemon_ = ports_.createRemotePort(*answer.portName);
  }
  void connect() { use(ports_.connect({})->createNetworkMonitorLogChannel(name)); }
  bool isConnected() const { return daemon_ && daemon_->isValid(); }

  SendResult ask(const PlistValue& command, MessageId id = 0) {
    using namespace std::chrono_literals;
    const Bytes bytes = plists_.serialiseXml(command).value();
    return daemon_->sendRequest(id, bytes, 1s, 1s, RemotePort::Reply::awaited);
  }
  void start(std::initializer_list<PlistValue> codes, std::initializer_list<PlistValue> extraCodes = {}) {
    ask(PlistDictionary::make({{"SetState", "Streaming"},
                               {"SetOrvaneLogCodes", PlistArray::make(codes)},
                               {"SetTelvonExtraCodes", PlistArray::make(extraCodes)}}));
  }
  void startEverything() { ask(PlistDictionary::make({{"SetState", "Streaming"}})); }
  // Closes its own port; what commands go over stays open.
  void leave() { port_.reset(); }
  // The other way round.
  void hangUp() { daemon_.reset(); }

  Bytes bytesReceived() const {
    Bytes all;
    for (const Received& message : received)
      all.insert(all.end(), message.bytes.begin(), message.bytes.end());
    return all;
  }

  std::string name;
  LogChannelAnswer answered;
  std::vector<Received> received;

 private:
  FakePorts& ports_;
  std::unique_ptr<LocalPort> port_;
  std::unique_ptr<RemotePort> daemon_;
  LibplistSerialiser plists_;
};

inline PlistValue getTechnology() {
  return PlistDictionary::make({{"GetTechnology", "GetTechnology"}});
}

}  // namespace kelvasi::sim::test
