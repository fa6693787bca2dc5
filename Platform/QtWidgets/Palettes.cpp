// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/Palettes.h"

#include <array>

namespace kelvasi {

namespace {

struct Colour {
  std::array<QPalette::ColorRole, 3> roles;
  QRgb light;
  QRgb dark;
};

constexpr auto none = QPalette::NColorRoles;

// Texts reach a contrast of 4.5 to 1 (WCAG 2.1, 1.4.3), chevrons one of 3 to 1 on rows, pressed or
// not (1.4.11).
constexpr std::array colours{
    Colour{{QPalette::Base, none, none}, 0xFFFFFFFF, 0xFF121417},
    Colour{{QPalette::AlternateBase, QPalette::Midlight, none}, 0xFFE6ECF5, 0xFF26303D},
    Colour{{QPalette::ToolTipBase, none, none}, 0xFFFFFFFF, 0xFF262A31},
    Colour{{QPalette::Window, QPalette::Button, none}, 0xFFF6F7F9, 0xFF1C1F24},
    Colour{{QPalette::Light, none, none}, 0xFFECEEF2, 0xFF08090B},
    Colour{{QPalette::Text, QPalette::WindowText, QPalette::ButtonText}, 0xFF14171C, 0xFFF0F2F5},
    Colour{{QPalette::ToolTipText, none, none}, 0xFF14171C, 0xFFF0F2F5},
    Colour{{QPalette::PlaceholderText, none, none}, 0xFF5A6472, 0xFF9AA4B2},
    Colour{{QPalette::Mid, none, none}, 0xFFD9DDE3, 0xFF30353D},
    Colour{{QPalette::Dark, none, none}, 0xFF78828F, 0xFF8490A0},
    Colour{{QPalette::Highlight, QPalette::Link, none}, 0xFF1B5FCC, 0xFF7DB0FF},
    Colour{{QPalette::HighlightedText, none, none}, 0xFFFFFFFF, 0xFF0B1424},
    Colour{{QPalette::Shadow, none, none}, 0xFF000000, 0xFF000000},
};

}  // namespace

QPalette paletteOf(ColourScheme scheme) {
  QPalette palette;
  for (const Colour& colour : colours) {
    for (const QPalette::ColorRole role : colour.roles) {
      if (role != none)
        palette.setColor(role, QColor::fromRgba(scheme == ColourScheme::dark ? colour.dark : colour.light));
    }
  }
  return palette;
}

}  // namespace kelvasi
