// SPDX-License-Identifier: Apache-2.0
// Bars for the share of each bin, and a curve for the share of all values up to it.
#include <algorithm>
#include <numeric>

#include "Report/Drawing.h"
#include "Report/Report.h"

namespace kelvasi::report {

std::string svgOf(const Histogram& histogram) {
  const double total =
      static_cast<double>(std::accumulate(histogram.bins.begin(), histogram.bins.end(), std::uint64_t{0}));
  if (total == 0) return {};
  const double most = static_cast<double>(*std::ranges::max_element(histogram.bins));
  const double width = plotWidth / static_cast<double>(histogram.bins.size());
  const Scale shares{0, 100, 25};
  std::string bars;
  std::string curve = "M0 300";
  double sum = 0;
  for (std::size_t at = 0; at < histogram.bins.size(); ++at) {
    const auto count = static_cast<double>(histogram.bins[at]);
    const double x = width * static_cast<double>(at);
    const double height = plotHeight * count / most;
    sum += count;
    const double first = histogram.first + histogram.width * static_cast<double>(at);
    bars += "<rect x=\"" + numeral(x) + "\" y=\"" + numeral(plotHeight - height) + "\" width=\"" +
            numeral(width * 0.92, 2) + "\" height=\"" + numeral(height) + "\"><title>" +
            escaped(numeral(first) + " to " + numeral(first + histogram.width) + " " + histogram.unit + ": " +
                    numeral(100 * count / total, 2) + " %") +
            "</title></rect>";
    curve += "L" + numeral(x + width) + " " + numeral(shares.heightOf(100 * sum / total));
  }
  std::string labels;
  const std::size_t apart = std::max<std::size_t>(1, histogram.bins.size() / 8);
  for (std::size_t at = 0; at <= histogram.bins.size(); at += apart)
    labels += text(width * static_cast<double>(at), plotHeight + 20, "middle",
                   numeral(histogram.first + histogram.width * static_cast<double>(at)));
  return "<figure><figcaption>" + escaped(histogram.title) + " <small>" + escaped(histogram.unit) +
         "; bars: how many seconds, curve: % of them up to here</small></figcaption>" +
         svgBegin(histogram.title) + levelAxis(shares) + "<g class=\"bars\">" + bars +
         "</g><path class=\"curve\" d=\"" + curve + "\"/>" + labels + svgEnd() + "</figure>\n";
}

}  // namespace kelvasi::report
