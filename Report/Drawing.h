// SPDX-License-Identifier: Apache-2.0
// The frame of a chart in SVG: a plot of 1000 by 300 units with room for labels around it.
#pragma once

#include <string>

namespace kelvasi::report {

inline constexpr double plotWidth = 1000;
inline constexpr double plotHeight = 300;

// As short as it can be: "12", "-3.5".
std::string numeral(double number, int decimals = 1);

struct Scale {
  double least = 0;
  double most = 1;
  double step = 1;  // from one label to the next

  // A scale of round numbers with some five labels.
  static Scale around(double least, double most);
  double heightOf(double value) const { return plotHeight * (most - value) / (most - least); }
};

std::string svgBegin(const std::string& label);
std::string svgEnd();
// Lines and numbers of the left axis.
std::string levelAxis(const Scale& scale);
std::string text(double x, double y, const std::string& anchor, const std::string& words);

}  // namespace kelvasi::report
