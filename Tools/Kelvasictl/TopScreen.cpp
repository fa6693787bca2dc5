// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/TopScreen.h"

#include <chrono>
#include <utility>

#include "Model/SnapshotFile.h"
#include "Platform/Posix/OutputFile.h"
#include "Platform/Posix/PosixFiles.h"
#include "Tools/Kelvasictl/ThemeChoice.h"
#include "Tools/Kelvasictl/ToolError.h"
#include "Tools/LogDirectory.h"

namespace kelvasi {

namespace {

using namespace std::chrono_literals;

}  // namespace

void TopOptions::addTo(OptionSet verb) {
  verb.add("--theme", theme,
           "dark, light or a file of colours (Docs/terminal.md); otherwise terminal.theme in the settings, "
           "or as the terminal's ground is")
      .type("THEME");
}

TopScreen::TopScreen(const TopOptions& options, Parts parts)
    : parts_(std::move(parts)),
      terminal_(parts_.characters, chosenTheme(options.theme)),
      top_(parts_.scene, parts_.style,
           {.copy = [this](std::string_view text) { return terminal_.copy(text); },
            .save = [this](const PlistValue& contents,
                           const std::string& description) { return save(contents, description); },
            .redraw = [this] { terminal_.redraw(); }}),
      keys_(terminal_.input(), [this] { takeKeys(); }),
      signals_(terminal_.signalDescriptor(), [this] { takeSignals(); }),
      timer_(parts_.queue.repeat(1s, [this] { second(); })) {
  draw();
}

void TopScreen::draw() {
  const top::Look look{.set = terminal_.characters(), .hasColours = terminal_.hasColours()};
  const top::Drawing drawing = top_.draw(terminal_.size(), look);
  terminal_.show(drawing.grid, drawing.cursor);
}

// Drawn after each, as what a key means depends on what is shown.
void TopScreen::takeKeys() {
  if (!terminal_.isThere()) return parts_.quit();
  while (const auto key = terminal_.next()) {
    if (!top_.take(*key)) return parts_.quit();
    draw();
  }
  if (parts_.taken) parts_.taken();
}

void TopScreen::takeSignals() {
  terminal_.takeSignals();
  draw();
}

void TopScreen::second() {
  parts_.pass();
  top_.pass();
  draw();
}

std::string TopScreen::save(const PlistValue& contents, const std::string& description) const {
  const PlistDate now = parts_.platform.clock.now();
  const auto bytes = parts_.platform.plists.serialiseXml(snapshotDictionary(now, contents, description));
  try {
    const std::string path = snapshotPath(makeLogDirectory(), now);
    PosixFiles files;
    if (files.exists(path)) return "Not saved: " + path + " is there already";
    if (!bytes || !files.write(path, *bytes)) return "Not saved: " + path + " cannot be written";
    return "Snapshot saved: " + path;
  } catch (const std::runtime_error& fault) {
    return std::string("Not saved: ") + fault.what();
  }
}

}  // namespace kelvasi
