// SPDX-License-Identifier: Apache-2.0
// The cockpit in the viewer's window: feeds it, gives it the room that there is and takes its keys.
//   on a phone        a card below the root pane's rows; O fills the window
//   held sideways     panes and cockpit beside each other
//   from 900 points   panes, cockpit and charts beside each other
#pragma once

#include <QJsonObject>
#include <QPointer>
#include <QTimer>
#include <QWidget>
#include <memory>
#include <string>
#include <vector>

#include "App/KelvasiApp.h"
#include "Cockpit/Cockpit.h"
#include "Platform/Attention.h"
#include "Platform/Clock.h"
#include "Platform/Files.h"
#include "Platform/QtWidgets/PortalSetting.h"
#include "Platform/UserInterface/UserInterface.h"
#include "Tools/Kelvasi/Cockpit/CockpitPages.h"

namespace kelvasi {

class AlarmBanner;
class CockpitCard;
class CockpitPane;
class Layer;
class TopWidget;

// A child of the window, which it outlives in nothing.
class CockpitFront : public QObject, public CockpitPages::Host {
 public:
  struct Surroundings {
    const Clock& clock;
    Attention& attention;
    UserInterface& ui;
    Files& files;
    std::string directory;  // for the files of charts
  };
  CockpitFront(TopWidget& window, KelvasiApp& app, const Surroundings& surroundings);
  ~CockpitFront() override;

  cockpit::Cockpit& cockpit() { return *cockpit_; }
  // What is shown of it where: "card", "full", "beside" or "none".
  const char* placeName() const;
  // The page on top; null where only the card or nothing is shown.
  const CockpitPage* shownPage() const;
  cockpit::Snapshot snapshot() { return cockpit_->at(now()); }
  // What the banner says now; empty while there is none.
  QString bannerWords() const;

 protected:
  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  Arrival now() const override;
  void openPane(const std::string& nodePath) override;
  void keepFile(const std::string& ending, std::span<const std::uint8_t> bytes) override;

  cockpit::CockpitSetUp setUp();
  void tick();
  void alarm(const cockpit::AlarmLine& line);
  void tellLink();
  void refresh();
  void goBack();
  void watchTouches();
  void slide(const QPixmap& before, bool isUp);
  void arrange();
  void arrangeChart(bool isBeside);
  bool pinRow();
  void markNow();
  void open();
  void close();
  CockpitPane& pageHolder();
  bool takeKey(QKeyEvent& event);
  bool askMore(const QPoint& place);
  bool openSheetOf(class TableWidget& table, std::size_t row);

  TopWidget& window_;
  KelvasiApp& app_;
  Surroundings around_;
  std::unique_ptr<cockpit::Cockpit> cockpit_;
  std::unique_ptr<CockpitPages> pages_;
  CockpitCard* card_;  // children of the window
  CockpitPane* pane_;
  CockpitPane* side_;  // the chart beside the cockpit
  AlarmBanner* banner_;
  Arrival lastCall_{0};
  QPointer<Layer> layer_;
  std::string technologyOfPanes_;
  QTimer timer_;
  bool isAnimated_ = true;
  PortalSetting motion_;
};

}  // namespace kelvasi
