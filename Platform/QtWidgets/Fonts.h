// SPDX-License-Identifier: Apache-2.0
// Fonts of the platform, and the room that texts take in them.
#pragma once

#include <QFont>
#include <string_view>

#include "Platform/UserInterface/Font.h"
#include "Platform/UserInterface/Geometry.h"

namespace kelvasi {

// A point is a logical pixel, whatever the screen's resolution, times the text size.
QFont qtFont(const Font& font);

// How large texts are against their usual size. Kept by the QApplication, whose widgets are told of a change
// (QEvent::ApplicationFontChange). Held between 0.5 and 3.
double textScale();
void setTextScale(double scale);

// One line with equally wide digits, whole points rounded up.
Size sizeOfText(std::string_view text, const Font& font);

// Line breaks become spaces, and characters that only turn the direction of others become visible.
QString qtText(std::string_view text);

}  // namespace kelvasi
