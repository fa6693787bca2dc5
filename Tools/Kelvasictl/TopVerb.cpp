// SPDX-License-Identifier: Apache-2.0
// kelvasictl top: cockpit and panes on a terminal.
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "Platform/Qt/QtEventLoop.h"
#include "Tools/Kelvasictl/CockpitSetting.h"
#include "Tools/Kelvasictl/DriveScene.h"
#include "Tools/Kelvasictl/LiveScene.h"
#include "Tools/Kelvasictl/LiveSession.h"
#include "Tools/Kelvasictl/MessageTally.h"
#include "Tools/Kelvasictl/StandardStreams.h"
#include "Tools/Kelvasictl/TechnologyOption.h"
#include "Tools/Kelvasictl/ToolError.h"
#include "Tools/Kelvasictl/TopScreen.h"
#include "Tools/Kelvasictl/Verb.h"

namespace kelvasi {

namespace {

struct TopVerbOptions {
  std::string technology;
  std::vector<std::string> captures;
  TopOptions screen;
  LiveOptions live;
};

class LiveTop {
 public:
  LiveTop(const TopVerbOptions& options, terminal::CharacterSet characters)
      : session_(options.live, [this] { update(); }),
        style_(textStyle(session_.clock())),
        scene_(session_.model(), session_.clock(), style_),
        screen_(options.screen, {.scene = scene_,
                                 .queue = session_.queue(),
                                 .platform = session_.platform(),
                                 .style = style_,
                                 .characters = characters,
                                 .pass = [this] { scene_.pass(); },
                                 .quit = [this] { session_.end(); }}) {}

  void run() { session_.run(); }

 private:
  void update() {
    scene_.update();
    screen_.draw();
  }

  LiveSession session_;
  cockpit::TextStyle style_;
  LiveScene scene_;
  TopScreen screen_;
};

// A drive from captures. What a key asks for is done a slice at a time, between two turns of the event loop.
class DriveTop {
 public:
  DriveTop(const TopVerbOptions& options, terminal::CharacterSet characters)
      : surroundings_(options.live.surroundings),
        style_(textStyle(surroundings_.clock)),
        scene_(surroundings_, choiceOf(options), style_, [](const std::string& line) { complain(line); }) {
    if (!scene_.hasMessages()) throw ToolError(options.captures.front() + ": there is no message in it");
    screen_.emplace(options.screen,
                    TopScreen::Parts{.scene = scene_,
                                     .queue = queue_,
                                     .platform = surroundings_.platformWith(surroundings_.clock),
                                     .style = style_,
                                     .characters = characters,
                                     .pass = [this] { pass(); },
                                     .quit = [this] { loop_.quit(); },
                                     .taken = [this] { work(); }});
  }

  int run() {
    work();
    loop_.run();
    return scene_.hasFault() ? exitFault : exitSuccess;
  }

 private:
  static CaptureInput::Choice choiceOf(const TopVerbOptions& options) {
    CaptureInput::Choice choice{.paths = options.captures, .technology = {}};
    if (!options.technology.empty()) choice.technology = options.technology;
    return choice;
  }

  void pass() {
    scene_.pass();
    work();
  }

  void work() {
    if (isPosted_ || !scene_.isWorking()) return;
    isPosted_ = true;
    queue_.post([this] {
      isPosted_ = false;
      scene_.work();
      if (!scene_.isWorking()) screen_->draw();
      work();
    });
  }

  QtEventLoop loop_;  // first: it wants to be made before all else
  OfflineSurroundings surroundings_;
  QtMainQueue queue_;
  cockpit::TextStyle style_;
  DriveScene scene_;
  std::optional<TopScreen> screen_;
  bool isPosted_ = false;
};

int runTop(const TopVerbOptions& options) {
  const terminal::CharacterSet characters = terminal::charactersOfLocale();
  if (const std::string why = terminal::whyNoTerminal(); !why.empty()) throw ToolError(why);
  if (!options.captures.empty()) return DriveTop(options, characters).run();
  LiveTop(options, characters).run();
  return exitSuccess;
}

}  // namespace

Action declareTop(OptionSet verb) {
  const auto options = std::make_shared<TopVerbOptions>();
  verb.add("CAPTURE", options->captures,
           "a drive to go through, from pcap, pcapng or DLF files or snapshots, packed or not; otherwise a "
           "live link is shown");
  addTechnology(verb, options->technology);
  options->screen.addTo(verb);
  options->live.addTo(verb);
  return [options](MessageTally&) { return runTop(*options); };
}

}  // namespace kelvasi
