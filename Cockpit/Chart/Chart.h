// SPDX-License-Identifier: Apache-2.0
// A chart as it stands: which lines, which window of time, which cursors. What is drawn of it is a picture,
// made for a number of columns; it knows no points and no colours.
#pragma once

#include <array>
#include <chrono>
#include <optional>
#include <string>
#include <vector>

#include "Cockpit/Chart/Axis.h"
#include "Cockpit/Chart/ChartLine.h"
#include "Cockpit/Levels/Thresholds.h"

namespace kelvasi::cockpit {

// A line across the picture at a moment.
struct ChartMark {
  enum class Kind : std::uint8_t { cellChange, event, mark };

  Kind kind = Kind::event;
  double place = 0;  // 0 is the window's beginning, 1 its end
  Arrival time{0};
  std::string words;
};

// A stretch of values with one verdict.
struct ChartBand {
  Verdict verdict = Verdict::none;
  double from = 0;  // 0 is the lower end of the axis, 1 the upper
  double to = 0;
};

struct CursorValue {
  std::string text;  // "-95 dBm"; "no value" where the line has a gap
  std::optional<double> value;
};

struct ChartCursor {
  Arrival time{0};
  double place = 0;
  std::string timeText;             // "21:57:02"
  std::vector<CursorValue> values;  // one a line
};

struct ChartPicture {
  Arrival from{0};
  Arrival to{0};
  double least = 0;  // of the value axis
  double most = 1;
  std::string unit;  // of all lines; empty when they differ
  std::vector<ChartLine> lines;
  std::vector<Tick> valueTicks;
  std::vector<Tick> timeTicks;
  std::vector<ChartMark> marks;
  std::vector<ChartBand> bands;
  std::vector<ChartCursor> cursors;      // none, one or two
  std::string cursorTime;                // between two cursors: "41 s"
  std::vector<std::string> differences;  // the second less the first, one a line: "+3 dB"
  std::string why;                       // where nothing is to be drawn: "No values in this time"

  // 0 for `from`, 1 for `to`.
  double placeOf(Arrival time) const {
    return static_cast<double>((time - from).count()) / static_cast<double>((to - from).count());
  }
  // 0 for `least`, 1 for `most`.
  double heightOf(double value) const { return (value - least) / (most - least); }
};

class Chart {
 public:
  static constexpr std::chrono::nanoseconds shortest = std::chrono::minutes(1);
  static constexpr std::chrono::nanoseconds longest = std::chrono::hours(24);
  static constexpr std::size_t mostLines = 8;

  // False when it is there already, or past the most.
  bool add(const ChartLineKey& key);
  void remove(const ChartLineKey& key) { std::erase(lines_, key); }
  const std::vector<ChartLineKey>& lines() const { return lines_; }

  // The window ends now and moves on.
  void follow() { end_.reset(); }
  bool follows() const { return !end_; }
  std::chrono::nanoseconds length() const { return length_; }
  // Kept between the shortest and the longest.
  void setLength(std::chrono::nanoseconds length);
  // `factor` below 1 comes nearer; what is at `place` (0 to 1) of the window stays there.
  void zoom(double factor, double place, Arrival now);
  // By a share of the window: -0.5 is half a window back. Up to now; there it follows again.
  void pan(double share, Arrival now);
  void show(Arrival from, Arrival to);
  // The other's window of time and cursors; the lines stay.
  void keepTimeOf(const Chart& other);
  Arrival endAt(Arrival now) const { return end_ ? std::min(*end_, now) : now; }
  Arrival beginAt(Arrival now) const { return endAt(now) - length_; }
  // A place of 0 to 1 in the window.
  Arrival timeAt(double place, Arrival now) const;

  // `which`: 0 or 1. Nothing takes it away.
  void setCursor(std::size_t which, std::optional<Arrival> time) { cursors_.at(which) = time; }
  const std::array<std::optional<Arrival>, 2>& cursors() const { return cursors_; }

 private:
  std::vector<ChartLineKey> lines_;
  std::chrono::nanoseconds length_ = std::chrono::minutes(5);
  std::optional<Arrival> end_;  // nothing: now
  std::array<std::optional<Arrival>, 2> cursors_;
};

}  // namespace kelvasi::cockpit
