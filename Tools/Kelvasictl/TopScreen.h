// SPDX-License-Identifier: Apache-2.0
// A scene on the terminal of the process: draws it, and hands keys on.
#pragma once

#include <memory>
#include <optional>
#include <string>

#include "Platform/MainQueue.h"
#include "Platform/Qt/QtReadWatch.h"
#include "Platform/Terminal/CursesTerminal.h"
#include "Tools/Kelvasictl/Surroundings.h"
#include "Tools/OptionSet.h"
#include "Tools/Top/Top.h"

namespace kelvasi {

struct TopOptions {
  std::string theme;  // "dark", "light", or the name of a file; empty: by what is known of the terminal

  void addTo(OptionSet verb);
};

class TopScreen {
 public:
  struct Parts {
    top::Scene& scene;
    MainQueue& queue;
    const Platform platform;
    cockpit::TextStyle style;
    terminal::CharacterSet characters;
    std::function<void()> pass;  // every second, before it is drawn
    std::function<void()> quit;
    std::function<void()> taken = {};  // after keys
  };

  // Throws ToolError where there is no terminal, or no theme.
  TopScreen(const TopOptions& options, Parts parts);

  void draw();

 private:
  void takeKeys();
  void takeSignals();
  void second();
  std::string save(const PlistValue& contents, const std::string& description) const;

  Parts parts_;
  terminal::CursesTerminal terminal_;
  top::Top top_;
  QtReadWatch keys_;
  QtReadWatch signals_;
  std::unique_ptr<Timer> timer_;
};

}  // namespace kelvasi
