// SPDX-License-Identifier: Apache-2.0
// A chart over the whole screen.
#include <utility>

#include "Cockpit/Words/Age.h"
#include "Tools/Top/ChartDrawing.h"
#include "Tools/Top/Pages.h"

namespace kelvasi::top {

namespace {

using namespace cockpit;

constexpr double nearer = 0.5;
constexpr double share = 0.25;  // of the window, that a key moves it by

class ChartPage : public Page {
 public:
  ChartPage(Host& host, std::optional<ChartLineKey> line) : host_(host), isOfCells_(!line) {
    if (line) chart_.add(*line);
  }

  std::string title() const override { return "Chart, " + durationText(chart_.length()); }
  std::string keys() const override { return "+ - time  Left Right  Tab level  Esc back"; }

  Lines lines(int columns, int rows, const Look& look) override {
    const Arrival now = host_.scene().moment();
    Cockpit& cockpit = host_.scene().cockpit();
    if (isOfCells_) follow(cockpit.chartLines(now, kind_));
    return drawChart([&](std::size_t points) { return cockpit.draw(chart_, now, points); }, columns, rows,
                     look);
  }

  bool take(const Key& key) override {
    const Arrival now = host_.scene().moment();
    using Kind = Key::Kind;
    if (key.is(U'+') || key.is(U'=') || key.kind == Kind::up || key.kind == Kind::wheelUp) {
      chart_.zoom(nearer, place(), now);
    } else if (key.is(U'-') || key.kind == Kind::down || key.kind == Kind::wheelDown) {
      chart_.zoom(1 / nearer, place(), now);
    } else if (key.kind == Kind::left || key.kind == Kind::right) {
      chart_.pan(key.kind == Kind::left ? -share : share, now);
    } else if (key.kind == Kind::home || key.kind == Kind::end) {
      chart_.follow();
    } else if (key.kind == Kind::tab) {
      nextLevel();
    } else {
      return key.kind == Kind::press;
    }
    return true;
  }

 private:
  double place() const { return chart_.follows() ? 1 : 0.5; }

  void follow(const std::vector<ChartLineKey>& lines) {
    if (lines == chart_.lines()) return;
    for (const ChartLineKey& line : std::vector(chart_.lines())) chart_.remove(line);
    for (const ChartLineKey& line : lines) chart_.add(line);
  }

  // Of those that the serving cell reports.
  void nextLevel() {
    const auto levels = host_.scene().face().serving.levels;
    bool isNext = !kind_;
    const auto before = kind_;
    kind_.reset();
    for (const Level& level : levels) {
      if (!level.isReported()) continue;
      if (isNext && (before || &level != &levels.front())) {
        kind_ = level.kind;
        return;
      }
      isNext = isNext || level.kind == before;
    }
  }

  Host& host_;
  bool isOfCells_;
  Chart chart_;
  std::optional<LevelKind> kind_;
};

}  // namespace

std::unique_ptr<Page> makeChartPage(Host& host, std::optional<ChartLineKey> line) {
  return std::make_unique<ChartPage>(host, line);
}

}  // namespace kelvasi::top
