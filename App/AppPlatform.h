// SPDX-License-Identifier: Apache-2.0
// What the application is given.
#pragma once

#include <string>

#include "Platform/Platform.h"

namespace kelvasi {

struct ShellPaths {
  std::string logDirectory;           // where snapshots are written
  std::string internalInstallMarker;  // a file whose existence allows the Save button
};

struct AppPlatform {
  Platform core;
  LinkPlatform link;
  ShellPlatform shell;
  ShellPaths paths;
};

}  // namespace kelvasi
