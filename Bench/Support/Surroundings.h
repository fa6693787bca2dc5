// SPDX-License-Identifier: Apache-2.0
// The surroundings of the benchmarks: the real ones, with traces masked and the system log's lines dropped.
#pragma once

#include "Platform/Platform.h"
#include "Platform/Plist/LibplistSerialiser.h"
#include "Platform/Posix/PackageResources.h"
#include "Platform/Posix/PosixClock.h"
#include "Platform/SystemLog.h"
#include "Platform/TraceOutput.h"

namespace kelvasi::bench {

// As with KELVASI_LOG_LEVEL=err; an error line is composed, then dropped.
class MaskedLog : public SystemLog {
 public:
  bool wants(LogPriority priority) const override { return (static_cast<int>(priority) & 7) <= 3; }
  void write(LogPriority, std::string_view) override {}
};

class NoTrace : public TraceOutput {
 public:
  void writeLine(std::string_view) override {}
};

struct Surroundings {
  MaskedLog log;
  NoTrace trace;
  LibplistSerialiser plists;
  PackageResources resources{KELVASI_BENCH_RESOURCES};
  PosixClock clock;

  Platform platform() { return {log, trace, plists, resources, clock}; }
};

}  // namespace kelvasi::bench
