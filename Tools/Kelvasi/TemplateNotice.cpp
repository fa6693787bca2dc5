// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasi/TemplateNotice.h"

#include "Platform/Posix/PackageResources.h"
#include "Platform/UserInterface/UserInterface.h"

namespace kelvasi {

void noticeMissingTemplates(const PackageResources& resources, UserInterface& ui) {
  if (!resources.pathsOfType("plist").empty()) return;
  ui.showAlert("No display templates",
               "Without them most of the display stays empty. They were looked for in " +
                   resources.directory().native() +
                   ". Install Kelvasi as a whole, or name their directory in KELVASI_RESOURCES.",
               "Close");
}

}  // namespace kelvasi
