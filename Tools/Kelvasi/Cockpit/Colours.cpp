// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasi/Cockpit/Colours.h"

namespace kelvasi {

namespace {

const CockpitColours light{
    .ground = 0xFFFFFF,
    .surface = 0xF6F7F9,
    .line = 0xD9DDE3,
    .text = 0x14171C,
    .secondary = 0x4A5361,
    .stale = 0x6B7480,
    .accent = 0x1B5FCC,
    .good = 0x00706A,
    .fair = 0xC27100,
    .poor = 0x8B1A2B,
    .series = {0x0B5FB0, 0xC25700, 0x00806A, 0xA4287F, 0x7A6400, 0x3A3F47, 0xB3261E, 0x5B3FA0},
};

const CockpitColours dark{
    .ground = 0x121417,
    .surface = 0x1C1F24,
    .line = 0x30353D,
    .text = 0xF0F2F5,
    .secondary = 0xB4BDC9,
    .stale = 0x8D97A5,
    .accent = 0x7DB0FF,
    .good = 0x3FB5A3,
    .fair = 0xFFD479,
    .poor = 0xE5585D,
    .series = {0x7DB0FF, 0xFFB057, 0x5FD6BD, 0xF08CCB, 0xE3D26F, 0xC9CFD8, 0xFF8A80, 0xB9A3FF},
};

}  // namespace

const QColor& CockpitColours::of(cockpit::Verdict verdict) const {
  switch (verdict) {
    case cockpit::Verdict::excellent:
    case cockpit::Verdict::good:
      return good;
    case cockpit::Verdict::fair:
      return fair;
    case cockpit::Verdict::poor:
    case cockpit::Verdict::veryPoor:
      return poor;
    case cockpit::Verdict::none:
      break;
  }
  return stale;
}

const QColor& CockpitColours::of(cockpit::Fade fade) const {
  if (fade == cockpit::Fade::none) return text;
  return fade == cockpit::Fade::faded ? secondary : stale;
}

const CockpitColours& coloursFor(const QPalette& palette) {
  constexpr int middle = 128;
  return palette.color(QPalette::Base).lightness() < middle ? dark : light;
}

}  // namespace kelvasi
