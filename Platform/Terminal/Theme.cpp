// SPDX-License-Identifier: Apache-2.0
#include "Platform/Terminal/Theme.h"

#include <algorithm>
#include <charconv>

namespace kelvasi::terminal {

namespace {

constexpr std::array<std::string_view, roles> roleNames{
    "text",    "secondary", "stale",   "line",    "accent",  "good",    "fair",    "poor",
    "series0", "series1",   "series2", "series3", "series4", "series5", "series6", "series7"};

const Theme dark{.colours = {Colour{}, 0xB4BDC9, 0x8D97A5, 0x5A6370, 0x7DB0FF, 0x3FB5A3, 0xFFD479, 0xE5585D,
                             0x7DB0FF, 0xFFB057, 0x5FD6BD, 0xF08CCB, 0xE3D26F, 0xC9CFD8, 0xFF8A80, 0xB9A3FF},
                 .ground = {}};
const Theme light{.colours = {Colour{}, 0x4A5361, 0x6B7480, 0xA0A7B1, 0x1B5FCC, 0x00706A, 0x9A5A00, 0x8B1A2B,
                              0x0B5FB0, 0xC25700, 0x00806A, 0xA4287F, 0x7A6400, 0x3A3F47, 0xB3261E, 0x5B3FA0},
                  .ground = {}};

// ECMA-48: red 1, green 2, yellow 3, blue 4, magenta 5, cyan 6, white 7.
constexpr std::array<int, roles> ofEight{-1, -1, -1, -1, 6, 2, 3, 1, 6, 3, 2, 5, 4, 7, 1, 5};

std::string_view wordOf(std::string_view& line) {
  const auto begin = std::min(line.find_first_not_of(" \t"), line.size());
  line.remove_prefix(begin);
  const auto end = std::min(line.find_first_of(" \t"), line.size());
  const std::string_view word = line.substr(0, end);
  line.remove_prefix(end);
  return word;
}

// False for what is no colour.
bool readColour(std::string_view word, Colour& colour) {
  if (word == "default") {
    colour.reset();
    return true;
  }
  std::uint32_t number = 0;
  if (word.size() != 7 || word[0] != '#') return false;
  const char* const end = word.data() + word.size();
  if (std::from_chars(word.data() + 1, end, number, 16).ptr != end) return false;
  colour = number;
  return true;
}

int channel(std::uint32_t colour, unsigned shift) {
  return static_cast<int>(colour >> shift & 0xFF);
}

int square(int number) {
  return number * number;
}

// xterm's steps: 0, 95, 135, 175, 215, 255.
int stepLevel(int step) {
  return step == 0 ? 0 : 55 + 40 * step;
}

int nearestStep(int level) {
  return level < 48 ? 0 : level < 115 ? 1 : (level - 35) / 40;
}

}  // namespace

const Theme& darkTheme() {
  return dark;
}

const Theme& lightTheme() {
  return light;
}

std::string Theme::change(std::string_view line) {
  const std::string_view name = wordOf(line);
  if (name.empty() || name[0] == '#') return {};
  const std::string_view word = wordOf(line);
  const std::string_view rest = wordOf(line);
  Colour colour;
  if (!readColour(word, colour) || (!rest.empty() && rest[0] != '#'))
    return "expected \"" + std::string(name) + " #RRGGBB\" or \"" + std::string(name) + " default\"";
  if (name == "ground") {
    ground = colour;
    return {};
  }
  for (std::size_t role = 0; role < roles; ++role) {
    if (roleNames[role] != name) continue;
    colours[role] = colour;
    return {};
  }
  return "there is no role \"" + std::string(name) + "\"";
}

int nearestOf256(std::uint32_t colour) {
  const std::array<int, 3> wanted{channel(colour, 16), channel(colour, 8), channel(colour, 0)};
  int cube = 16;
  int cubeError = 0;
  constexpr std::array<int, 3> weight{36, 6, 1};
  for (std::size_t at = 0; at < 3; ++at) {
    cube += weight[at] * nearestStep(wanted[at]);
    cubeError += square(stepLevel(nearestStep(wanted[at])) - wanted[at]);
  }
  const int grey = std::clamp(((wanted[0] + wanted[1] + wanted[2]) / 3 - 3) / 10, 0, 23);
  int greyError = 0;
  for (const int level : wanted) greyError += square(8 + 10 * grey - level);
  return greyError < cubeError ? 232 + grey : cube;
}

int nearestOf8(Role role) {
  return ofEight[static_cast<std::size_t>(role)];
}

}  // namespace kelvasi::terminal
