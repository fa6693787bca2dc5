// SPDX-License-Identifier: Apache-2.0
// Fonts of the platform, and the room that texts take in them.
#pragma once

#include <QFont>
#include <string_view>

#include "Platform/UserInterface/Font.h"
#include "Platform/UserInterface/Geometry.h"

namespace kelvasi {

// A point is a logical pixel, whatever the screen's resolution.
QFont qtFont(const Font& font);

// One line, whole points rounded up.
Size sizeOfText(std::string_view text, const Font& font);

QString qtText(std::string_view text);

}  // namespace kelvasi
