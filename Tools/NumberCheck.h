// SPDX-License-Identifier: Apache-2.0
// A check of an option's number that says in plain words what is wrong with it.
#pragma once

#include <CLI/CLI.hpp>
#include <charconv>
#include <string>

namespace kelvasi {

// Both ends included; `range` tells them to people: "from 0 to 1000".
inline CLI::Validator numberBetween(double least, double most, const std::string& range) {
  const auto check = [=](const std::string& text) -> std::string {
    double number = 0;
    const char* const end = text.data() + text.size();
    const auto [rest, error] = std::from_chars(text.data(), end, number);
    const bool isNumber = error == std::errc() && rest == end;
    if (isNumber && number >= least && number <= most) return {};
    return "\"" + text + "\" is no number " + range;
  };
  return {check, ""};
}

}  // namespace kelvasi
