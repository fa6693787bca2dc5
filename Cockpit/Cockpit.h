// SPDX-License-Identifier: Apache-2.0
// What the cockpit shows, for any front end. It is fed with readings and told the time; it reads no clock and
// makes no text until somebody looks.
//
//   Cockpit cockpit;
//   model.gatherReadings([&](const Readings& readings, const Intake& intake) { cockpit.take(readings,
//   intake); }); on every tick:      cockpit.pass(now); on every repaint:   draw(cockpit.at(now));
//
// All of it is for one thread.
#pragma once

#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "Cockpit/Chart/Chart.h"
#include "Cockpit/Events/Coverage.h"
#include "Cockpit/Rows/RowSheet.h"
#include "Cockpit/Rows/Search.h"
#include "Cockpit/Snapshot.h"
#include "LogGenerator/Intake.h"
#include "LogGenerator/Readings.h"
#include "Radio/Operators.h"
#include "Survey/Survey.h"

namespace kelvasi::cockpit {

struct CockpitSetUp {
  // Together 30.6 MB at most: 810,000 seconds with a value of cells and 270,000 of rows, older ones in
  // buckets of 8 s and 64 s.
  static constexpr survey::SeriesSize cellSeries{.series = 4096, .blocks = {27000, 9000, 4500}};
  static constexpr survey::SeriesSize rowSeries{.series = 1024, .blocks = {9000, 3000, 1500}};

  TextStyle style = {};
  Thresholds thresholds = {};
  Operators operators = {};
  survey::SeriesSize ofCells = cellSeries;
  survey::SeriesSize ofRows = rowSeries;
  std::size_t mostCells = 16;  // of the table of cells
  std::function<void(const EventLine& event)> onEvent = {};
  std::function<void(const AlarmLine& alarm)> onAlarm = {};
};

class Cockpit {
 public:
  explicit Cockpit(CockpitSetUp setUp = {});
  ~Cockpit();
  Cockpit(const Cockpit&) = delete;
  Cockpit& operator=(const Cockpit&) = delete;

  // --- Feeding.

  // Each message, in the order of arrival: its readings, and the intake that has counted it already.
  void take(const Readings& readings, const Intake& intake);
  // The time without a message.
  void pass(Arrival now);
  // What is known of the connection, whenever that changes.
  void hear(LinkReport report);

  // --- Looking.

  // All that is on the cockpit's face. Times may step back.
  Snapshot at(Arrival now);
  // Keeps the rows of cells where they are, while a finger is near or one is selected.
  void hold(bool isHeld);

  // All events that are kept: `most` of them from the newest on, `skip` left out.
  std::vector<EventLine> events(std::size_t most, std::size_t skip = 0) const;
  std::size_t eventCount() const;  // that are kept
  // What arrived and was not shown, since the beginning.
  Coverage coverage(Arrival now) const;

  // --- Rows. Paths are RFC 6901 pointers into the display; rowPath() finds one for a node of the panes.

  std::optional<RowSheet> sheet(std::string_view path, Arrival now) const;
  SearchResult search(std::string_view text, Arrival now, std::size_t most = 50) const;
  // The row that a node of the display tree is, "/UMTS/UMTS Set/0/RSCP"; nothing for a branch.
  std::optional<std::string> rowPath(std::string_view nodePath) const;

  bool pin(std::string_view path);  // false: no such row, or too many
  void unpin(std::string_view key);
  std::string pinKey(std::string_view path) const;  // empty: not pinned
  std::vector<std::string> pinKeys() const;         // to be remembered
  void restorePins(const std::vector<std::string>& keys);

  // --- Alarms. Returns what is wrong with a rule, "at 6: expected a number"; empty when it was taken.

  std::string addAlarm(std::string_view rule);
  void removeAlarm(std::size_t rule);
  std::vector<std::string> alarmRules() const;  // to be remembered

  // --- Marks.

  std::uint64_t mark(Arrival time, std::string note = {});  // its number
  bool note(std::uint64_t mark, std::string text);          // false: no such mark
  const std::vector<MarkLine>& marks() const;               // in the order of setting

  // --- Charts.

  // What a row's chart draws: its cell's level, or the row. Nothing where it is no number.
  std::optional<ChartLineKey> chartLine(std::string_view path) const;
  // The level of the serving cell and of the best neighbours in the same: by default the most important of
  // the serving cell's technology.
  std::vector<ChartLineKey> chartLines(Arrival now, std::optional<LevelKind> kind = {},
                                       std::size_t most = 6) const;
  ChartPicture draw(const Chart& chart, Arrival now, std::size_t columns) const;
  // What the chart shows, a line each second with a value: time, then minimum, mean and maximum of each line.
  std::string csv(const Chart& chart, Arrival now) const;

  // --- Settings and what lies below.

  Thresholds& thresholds();
  const TextStyle& style() const;
  const survey::Survey& survey() const;
  const RowBook& rows() const;
  std::size_t bytes() const;  // of all series, at most

 private:
  struct Parts;
  std::unique_ptr<Parts> parts_;
};

}  // namespace kelvasi::cockpit
