// SPDX-License-Identifier: Apache-2.0
// What a report of a drive shows, as plain texts and numbers. Times are in seconds since 1970 UTC.
#pragma once

#include <cstdint>
#include <string>
#include <utility>
#include <vector>

namespace kelvasi::report {

// The values of a stretch of time.
struct Point {
  double time = 0;  // where it begins
  double least = 0;
  double mean = 0;
  double most = 0;
};

struct Line {
  std::string name;
  std::vector<Point> points;  // in order of time; a stretch without values has none
};

struct Chart {
  std::string title;
  std::string unit;
  double from = 0;
  double to = 0;
  double step = 1;  // from one point to the next where none is missing
  std::vector<Line> lines;
  std::string note = {};  // what is not shown
};

// How often which values were.
struct Histogram {
  std::string title;
  std::string unit;
  double first = 0;  // where the first bin begins
  double width = 1;  // of a bin
  std::vector<std::uint64_t> bins;
};

struct Table {
  std::string title;
  std::vector<std::string> headings;
  std::vector<std::vector<std::string>> rows;
  std::string note = {};  // what is not shown, or that there is nothing
};

struct Report {
  std::string title;
  std::vector<std::pair<std::string, std::string>> summary;
  std::vector<Chart> charts;
  std::vector<Histogram> histograms;
  std::vector<Table> tables;
};

// One HTML document that needs nothing else. All texts are escaped.
std::string htmlOf(const Report& report);

// For texts and attributes of HTML.
std::string escaped(const std::string& text);

// Each to be put into a figure.
std::string svgOf(const Chart& chart);
std::string svgOf(const Histogram& histogram);

}  // namespace kelvasi::report
