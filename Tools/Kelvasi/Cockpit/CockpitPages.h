// SPDX-License-Identifier: Apache-2.0
// The pages of the cockpit, made of what it knows.
#pragma once

#include <functional>
#include <span>
#include <string>
#include <vector>

#include "Cockpit/Cockpit.h"
#include "Tools/Kelvasi/Cockpit/CockpitPage.h"
#include "Tools/Kelvasi/Cockpit/FaceBlocks.h"

namespace kelvasi {

class ChartPage;
class CockpitPane;

class CockpitPages {
 public:
  class Host {
   public:
    virtual Arrival now() const = 0;
    // Shows the pane of a row of the display tree, with the row marked.
    virtual void openPane(const std::string& nodePath) = 0;
    // Keeps a new file beside the snapshots and says where; `ending` begins with a point.
    virtual void keepFile(const std::string& ending, std::span<const std::uint8_t> bytes) = 0;

   protected:
    ~Host() = default;
  };

  CockpitPages(cockpit::Cockpit& cockpit, Host& host) : cockpit_(cockpit), host_(host) {}

  // Each opens on `in`, or is its first page.
  CockpitPage* face(CockpitPane& in);
  // Without lines that of the serving cell and its neighbours.
  CockpitPage* chart(CockpitPane& in, std::vector<cockpit::ChartLineKey> lines);
  void openChart(CockpitPane& in, std::vector<cockpit::ChartLineKey> lines);
  void openEvents(CockpitPane& in);
  void openCoverage(CockpitPane& in);
  void openAlarms(CockpitPane& in);
  void openSheet(CockpitPane& in, const std::string& path);
  void openSearch(CockpitPane& in);
  void openKeys(CockpitPane& in);
  void openAlarmField(CockpitPane& in, const std::string& begin);
  // Sets a mark, and takes its note if one follows.
  void openNote(CockpitPane& in);
  void openNoteOf(CockpitPane& in, std::uint64_t mark, const std::string& note);
  void togglePin(const std::string& path);

 private:
  ChartPage* makeChart(CockpitPane& in, std::vector<cockpit::ChartLineKey> lines);
  void openSaveChart(CockpitPane& in, ChartPage& chart);
  void openMoment(CockpitPane& in, Arrival moment);
  FaceActions actionsOn(CockpitPane& in);
  Blocks sheetBlocks(CockpitPane& in, const std::string& path, double width);
  void addSheetActions(CockpitPane& in, const cockpit::RowSheet& sheet, Blocks& blocks, double width);
  Blocks foundBlocks(CockpitPane& in, const QString& text, double width);

  cockpit::Cockpit& cockpit_;
  Host& host_;
  cockpit::Chart chartTime_;  // of all charts
};

}  // namespace kelvasi
