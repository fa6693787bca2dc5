// SPDX-License-Identifier: Apache-2.0
// The receiving end of a message port.
#pragma once

#include "Platform/MessagePort.h"
#include "Platform/Qt/FrameServer.h"

namespace kelvasi {

class QtLocalPort : public LocalPort {
 public:
  // Null, and one error line, when the name cannot be had.
  static std::unique_ptr<QtLocalPort> open(std::string_view name, SystemLog& log, ReceiveHandler handler);

  bool isValid() const override { return server_ != nullptr; }
  void invalidate() override;
  void setInvalidationHandler(InvalidationHandler handler) override { onInvalid_ = std::move(handler); }
  void setDesertionHandler(DesertionHandler handler) override;

 private:
  explicit QtLocalPort(std::unique_ptr<FrameServer> server) : server_(std::move(server)) {}

  std::unique_ptr<FrameServer> server_;
  InvalidationHandler onInvalid_;
};

}  // namespace kelvasi
