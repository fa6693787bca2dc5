// SPDX-License-Identifier: Apache-2.0
#include <string_view>

#include "Report/Report.h"

namespace kelvasi::report {

namespace {

constexpr std::string_view style = R"(<style>
:root{color-scheme:light dark;--back:#fff;--text:#1d1d1f;--dim:#6e6e73;--line:#d2d2d7;
--k0:#0068d6;--k1:#c2410c;--k2:#15803d;--k3:#9333ea;--k4:#b45309;--k5:#0e7490;--k6:#be185d;--k7:#57534e}
@media (prefers-color-scheme:dark){:root{--back:#161618;--text:#f2f2f7;--dim:#a1a1a6;--line:#3a3a3e;
--k0:#5aa9ff;--k1:#ff9f5a;--k2:#5fd38a;--k3:#c79bff;--k4:#e6b94d;--k5:#5cc8dc;--k6:#ff8ab8;--k7:#b8b4ae}}
body{margin:0 auto;max-width:64rem;padding:1.5rem;background:var(--back);color:var(--text);
font:15px/1.45 system-ui,sans-serif}
h1{font-size:1.6rem;overflow-wrap:anywhere}h2{font-size:1.2rem;margin:2rem 0 .5rem}
dl{display:grid;grid-template-columns:max-content 1fr;gap:.2rem 1.2rem}dt{color:var(--dim)}dd{margin:0;overflow-wrap:anywhere}
figure{margin:1rem 0;break-inside:avoid}figcaption{font-weight:600}small,.note{color:var(--dim);font-weight:400}
figure>svg{width:100%;height:auto;overflow:visible}svg.plot{overflow:hidden}svg text{font-size:12px;fill:var(--dim)}
.grid{stroke:var(--line);fill:none}.cursor{stroke:var(--dim);fill:none;vector-effect:non-scaling-stroke}
.c0{--k:var(--k0)}.c1{--k:var(--k1)}.c2{--k:var(--k2)}.c3{--k:var(--k3)}.c4{--k:var(--k4)}.c5{--k:var(--k5)}
.c6{--k:var(--k6)}.c7{--k:var(--k7)}
.mean,.band{fill:none;stroke:var(--k);vector-effect:non-scaling-stroke;stroke-width:1.5;stroke-linecap:round}
.band{opacity:.25;stroke-width:1}.bars rect{fill:var(--k0);opacity:.55}
.curve{fill:none;stroke:var(--k1);stroke-width:2}
.legend span{white-space:nowrap;margin-right:1rem}.legend span::before{content:"";display:inline-block;
width:.8em;height:.8em;border-radius:50%;margin-right:.4em;background:var(--k)}.legend b{margin-left:.4em;font-weight:400}
.scroll{overflow-x:auto}table{border-collapse:collapse;width:100%;font-size:13px;font-variant-numeric:tabular-nums}
th,td{text-align:left;padding:.25rem .6rem .25rem 0;border-bottom:1px solid var(--line);vertical-align:top}
th{color:var(--dim);font-weight:600}
@media print{:root{--back:#fff;--text:#000;--dim:#444;--line:#bbb;--k0:#0068d6;--k1:#c2410c;--k2:#15803d;
--k3:#9333ea;--k4:#b45309;--k5:#0e7490;--k6:#be185d;--k7:#57534e;color-scheme:light}
body{max-width:none;padding:0;font-size:10pt}table{font-size:8pt}thead{display:table-header-group}
tr{break-inside:avoid}.scroll{overflow:visible}.help{display:none}}
@page{size:A4;margin:15mm}
</style>
)";

// Drag over a chart to see a part of it, twice press it to see all; the values at the pointer stand in the
// legend.
constexpr std::string_view script = R"(<script>
for (const figure of document.querySelectorAll("figure.time")) {
  const plot = figure.querySelector(".plot"), cursor = figure.querySelector(".cursor");
  const labels = [...figure.querySelectorAll("text")].slice(-6), {from, to, least, most} = figure.dataset;
  const lines = [...figure.querySelectorAll(".mean")].map(path =>
    path.getAttribute("d").match(/-?[\d.]+ -?[\d.]+/g)?.map(pair => pair.split(" ").map(Number)) ?? []);
  const values = figure.querySelectorAll(".legend b");
  let left = 0, width = 1000, begin = null;
  const timeAt = x => +from + (to - from) * x / 1000;
  const words = time => new Date(time * 1000).toISOString().slice(11, 19);
  const show = () => {
    plot.setAttribute("viewBox", `${left} 0 ${width} 300`);
    labels.forEach((label, at) => label.textContent = words(timeAt(left + width * at / 5)));
  };
  const placeOf = event => {
    const box = plot.getBoundingClientRect();
    return left + width * Math.min(1, Math.max(0, (event.clientX - box.left) / box.width));
  };
  plot.addEventListener("pointerdown", event => begin = placeOf(event));
  plot.addEventListener("pointerup", event => {
    const end = placeOf(event), size = Math.abs(end - begin);
    if (begin !== null && size > width / 100) { left = Math.min(begin, end); width = size; show(); }
    begin = null;
  });
  plot.addEventListener("dblclick", () => { left = 0; width = 1000; show(); });
  plot.addEventListener("pointermove", event => {
    const x = placeOf(event);
    cursor.setAttribute("d", `M${x} 0V300`);
    lines.forEach((points, at) => {
      const near = points.reduce((one, other) => Math.abs(other[0] - x) < Math.abs(one[0] - x) ? other : one, [-1e9]);
      const value = +most - (most - least) * near[1] / 300;
      values[at].textContent = Math.abs(near[0] - x) < width / 50 ? value.toFixed(1) : "";
    });
    figure.querySelector("figcaption").title = words(timeAt(x));
  });
}
</script>
)";

std::string tableHtml(const Table& table) {
  std::string html = "<h2>" + escaped(table.title) + "</h2>\n";
  if (!table.rows.empty()) {
    html += "<div class=\"scroll\"><table><thead><tr>";
    for (const std::string& heading : table.headings) html += "<th>" + escaped(heading) + "</th>";
    html += "</tr></thead>\n<tbody>\n";
    for (const auto& row : table.rows) {
      html += "<tr>";
      for (const std::string& cell : row) html += "<td>" + escaped(cell) + "</td>";
      html += "</tr>\n";
    }
    html += "</tbody></table></div>\n";
  }
  return table.note.empty() ? html : html + "<p class=\"note\">" + escaped(table.note) + "</p>\n";
}

}  // namespace

// Control characters are none of HTML.
std::string escaped(const std::string& text) {
  std::string result;
  for (const char each : text) {
    switch (each) {
      case '&':
        result += "&amp;";
        break;
      case '<':
        result += "&lt;";
        break;
      case '>':
        result += "&gt;";
        break;
      case '"':
        result += "&quot;";
        break;
      case '\'':
        result += "&#39;";
        break;
      default:
        result += static_cast<unsigned char>(each) < 0x20 || each == 0x7F ? ' ' : each;
    }
  }
  return result;
}

std::string htmlOf(const Report& report) {
  std::string html =
      "<!DOCTYPE html>\n<html lang=\"en\"><head><meta charset=\"utf-8\">\n"
      "<meta http-equiv=\"Content-Security-Policy\" content=\"default-src 'none'; style-src "
      "'unsafe-inline'; script-src 'unsafe-inline'\">\n"
      "<meta name=\"viewport\" content=\"width=device-width\">\n<title>" +
      escaped(report.title) + "</title>\n";
  html += style;
  html += "</head><body>\n<h1>" + escaped(report.title) + "</h1>\n<dl>";
  for (const auto& [name, words] : report.summary)
    html += "<dt>" + escaped(name) + "</dt><dd>" + escaped(words) + "</dd>\n";
  html += "</dl>\n";
  if (!report.charts.empty())
    html +=
        "<h2>Levels over time</h2>\n<p class=\"note help\">Drag over a chart to see a part of it, "
        "double-click to "
        "see all.</p>\n";
  for (const Chart& chart : report.charts) html += svgOf(chart);
  if (!report.histograms.empty()) html += "<h2>How often</h2>\n";
  for (const Histogram& histogram : report.histograms) html += svgOf(histogram);
  for (const Table& table : report.tables) html += tableHtml(table);
  html += script;
  return html + "</body></html>\n";
}

}  // namespace kelvasi::report
