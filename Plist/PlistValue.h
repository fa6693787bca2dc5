// SPDX-License-Identifier: Apache-2.0
// A property-list value: a string, integer, real, boolean, data blob or date, or a handle on a shared mutable
// dictionary or array. Copying a value copies scalars and shares containers, so that a section of a display
// that several owners hold is one and the same container.
#pragma once

#include "Plist/PlistContainers.h"
#include "Plist/PlistHandle.h"
