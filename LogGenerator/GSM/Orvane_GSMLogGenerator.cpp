// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/Orvane_GSMLogGenerator.h"

#include "LogGenerator/GSM/Orvane_GSMClassIndex.h"
#include "Platform/SystemLog.h"

namespace kelvasi {

namespace {

// Logs ahead of all else: its call stands in braces, whose elements are evaluated from left to right.
const Platform& announced(const Platform& platform) {
  platform.log.print(LogPriority::error, "Creating Orvane_GSMLogGenerator object");
  return platform;
}

}  // namespace

std::unique_ptr<LogGenerator> Orvane_GSMLogGenerator::generator(const Platform& platform) {
  return std::make_unique<Orvane_GSMLogGenerator>(platform);
}

Orvane_GSMLogGenerator::Orvane_GSMLogGenerator(const Platform& platform)
    : OrvaneLogGenerator2{announced(platform), "Orvane_GSM",
                          std::make_unique<Orvane_GSMClassIndex>(platform)} {}

Orvane_GSMLogGenerator::~Orvane_GSMLogGenerator() {
  platform().log.print(LogPriority::warning, "Orvane_GSMLogGenerator is destructed %p",
                       static_cast<void*>(this));
}

}  // namespace kelvasi
