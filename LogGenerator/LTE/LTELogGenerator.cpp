// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/LTE/LTELogGenerator.h"

#include "LogGenerator/LTE/LTEClassIndex.h"
#include "Platform/SystemLog.h"

namespace kelvasi {

namespace {

// Logs ahead of all else: its call stands in braces, whose elements are evaluated from left to right.
const Platform& announced(const Platform& platform) {
  platform.log.print(LogPriority::error, "Creating LTELogGenerator object");
  return platform;
}

}  // namespace

std::unique_ptr<LogGenerator> LTELogGenerator::generator(const Platform& platform) {
  return std::make_unique<LTELogGenerator>(platform);
}

LTELogGenerator::LTELogGenerator(const Platform& platform)
    : OrvaneLogGenerator2{announced(platform), "LTE", std::make_unique<LTEClassIndex>(platform)} {}

LTELogGenerator::~LTELogGenerator() {
  platform().log.print(LogPriority::warning, "LTELogGenerator is destructed %p", static_cast<void*>(this));
}

}  // namespace kelvasi
