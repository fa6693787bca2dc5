// SPDX-License-Identifier: Apache-2.0
// What the window says of an installation that is not whole.
#pragma once

namespace kelvasi {

class PackageResources;
class UserInterface;

// An alert over the window where there is no display template at all; nothing otherwise.
void noticeMissingTemplates(const PackageResources& resources, UserInterface& ui);

}  // namespace kelvasi
