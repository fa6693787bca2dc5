// SPDX-License-Identifier: Apache-2.0
#include "Report/Drawing.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstdio>

#include "Report/Report.h"

namespace kelvasi::report {

std::string numeral(double number, int decimals) {
  std::array<char, 64> digits;
  std::snprintf(digits.data(), digits.size(), "%.*f", decimals, number);
  std::string result = digits.data();
  if (result.find('.') != std::string::npos) {
    result.erase(result.find_last_not_of('0') + 1);
    if (result.back() == '.') result.pop_back();
  }
  return result == "-0" ? "0" : result;
}

Scale Scale::around(double least, double most) {
  constexpr std::array steps{1.0, 2.0, 5.0, 10.0};
  const double span = std::max(most - least, 1e-6);
  const double decade = std::pow(10, std::floor(std::log10(span / 5)));
  double step = decade * steps.back();
  for (const double each : steps) {
    if (span / (decade * each) > 6) continue;
    step = decade * each;
    break;
  }
  Scale scale{std::floor(least / step) * step, std::ceil(most / step) * step, step};
  if (scale.most <= scale.least) scale.most = scale.least + step;
  return scale;
}

std::string svgBegin(const std::string& label) {
  return "<svg viewBox=\"-60 -12 1072 348\" role=\"img\" aria-label=\"" + escaped(label) + "\">";
}

std::string svgEnd() {
  return "</svg>";
}

std::string text(double x, double y, const std::string& anchor, const std::string& words) {
  return "<text x=\"" + numeral(x) + "\" y=\"" + numeral(y) + "\" text-anchor=\"" + anchor + "\">" +
         escaped(words) + "</text>";
}

std::string levelAxis(const Scale& scale) {
  std::string axis;
  for (double value = scale.least; value < scale.most + scale.step / 2; value += scale.step) {
    const double y = scale.heightOf(value);
    axis +=
        "<path class=\"grid\" d=\"M0 " + numeral(y) + "H1000\"/>" + text(-6, y + 4, "end", numeral(value, 2));
  }
  return axis;
}

}  // namespace kelvasi::report
