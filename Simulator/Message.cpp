// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Message.h"

#include "LogGenerator/RecordFraming.h"

namespace kelvasi::sim {

Message logMessage(Bytes bytes) {
  Message message{.bytes = std::move(bytes), .logCode = std::nullopt};
  if (const auto framed = frameRecord(message.bytes)) message.logCode = framed->logCode;
  return message;
}

}  // namespace kelvasi::sim
