// SPDX-License-Identifier: Apache-2.0
// Levels over time. A line is the means, the band behind it reaches from the least to the most.
#include <algorithm>
#include <array>
#include <cmath>
#include <limits>

#include "Report/Drawing.h"
#include "Report/Moments.h"
#include "Report/Report.h"

namespace kelvasi::report {

namespace {

Scale scaleOf(const Chart& chart) {
  double least = std::numeric_limits<double>::max();
  double most = std::numeric_limits<double>::lowest();
  for (const Line& line : chart.lines) {
    for (const Point& point : line.points) {
      least = std::min(least, point.least);
      most = std::max(most, point.most);
    }
  }
  return least > most ? Scale() : Scale::around(least, most);
}

class Drawing {
 public:
  explicit Drawing(const Chart& chart) : chart_(chart), scale_(scaleOf(chart)) {}

  std::string svg() const {
    std::string drawn = svgBegin(chart_.title + " over time");
    drawn += levelAxis(scale_) + timeAxis();
    drawn +=
        "<svg class=\"plot\" width=\"1000\" height=\"300\" viewBox=\"0 0 1000 300\" "
        "preserveAspectRatio=\"none\"><rect width=\"1000\" height=\"300\" fill=\"transparent\"/>";
    for (std::size_t at = 0; at < chart_.lines.size(); ++at) drawn += lineAt(at);
    return drawn + "<path class=\"cursor\" d=\"M-9 0V300\"/></svg>" + svgEnd();
  }

 private:
  double xOf(double time) const { return plotWidth * (time - chart_.from) / (chart_.to - chart_.from); }

  std::string timeAxis() const {
    constexpr int labels = 5;
    std::string axis;
    for (int at = 0; at <= labels; ++at) {
      const double time = chart_.from + (chart_.to - chart_.from) * at / labels;
      axis += text(plotWidth * at / labels, plotHeight + 20,
                   at == 0        ? "start"
                   : at == labels ? "end"
                                  : "middle",
                   timeOfDay(time));
    }
    return axis;
  }

  std::string lineAt(std::size_t at) const {
    const std::string kind = " class=\"c" + std::to_string(at % 8) + "\"";
    std::string means;
    std::string band;
    double last = -std::numeric_limits<double>::max();
    for (const Point& point : chart_.lines[at].points) {
      const std::string x = numeral(xOf(point.time));
      means += (point.time - last > 1.5 * chart_.step ? "M" : "L") + x + " " +
               numeral(scale_.heightOf(point.mean));
      band +=
          "M" + x + " " + numeral(scale_.heightOf(point.least)) + "V" + numeral(scale_.heightOf(point.most));
      last = point.time;
    }
    return "<g" + kind + "><path class=\"band\" d=\"" + band + "\"/><path class=\"mean\" d=\"" + means +
           "h.01\"><title>" + escaped(chart_.lines[at].name) + "</title></path></g>";
  }

  const Chart& chart_;
  Scale scale_;
};

}  // namespace

std::string svgOf(const Chart& chart) {
  if (chart.lines.empty() || chart.to <= chart.from) return {};
  const Scale scale = scaleOf(chart);
  std::string figure = "<figure class=\"time\" data-from=\"" + numeral(chart.from, 3) + "\" data-to=\"" +
                       numeral(chart.to, 3) + "\" data-least=\"" + numeral(scale.least, 3) +
                       "\" data-most=\"" + numeral(scale.most, 3) + "\"><figcaption>" + escaped(chart.title) +
                       " <small>" + escaped(chart.unit) + "</small></figcaption>" + Drawing(chart).svg() +
                       "<p class=\"legend\">";
  for (std::size_t at = 0; at < chart.lines.size(); ++at)
    figure += "<span class=\"c" + std::to_string(at % 8) + "\">" + escaped(chart.lines[at].name) +
              "<b></b></span> ";
  return figure + "</p>" + (chart.note.empty() ? "" : "<p>" + escaped(chart.note) + "</p>") + "</figure>\n";
}

}  // namespace kelvasi::report
