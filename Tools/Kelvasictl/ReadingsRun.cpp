// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/ReadingsRun.h"

#include <utility>

#include "Telvon/TechnologyName.h"
#include "Tools/Kelvasictl/ToolError.h"

namespace kelvasi {

ReadingsRun::ReadingsRun(const ReadingWish& wish, const Surroundings& surroundings,
                         CaptureInput::Choice choice)
    : wish_(wish), surroundings_(surroundings), choice_(std::move(choice)), clock_(surroundings.clock) {}

void ReadingsRun::run(const CaptureOutput& output) {
  ReadingPrinter printer(wish_, output.print);
  CaptureInput input(choice_, surroundings_.plists, output.complain, output.advance);
  while (const auto message = input.next()) {
    if (!decode_) {
      input.keepTechnology(message->technology);
      printer.setTechnology(message->technology);
      begin(message->technology);
    }
    decode_->take(*message);
    printer.take(readings_);
  }
  printer.flush();
  hasFault_ = input.hasFault();
}

void ReadingsRun::begin(std::string_view technology) {
  auto generator = LogGenerator::generatorFromTechnology(technology, surroundings_.platformWith(clock_));
  if (!generator)
    throw ToolError("there is no generator for " + std::string(shortTechnologyName(technology)));
  generator->gatherInto(&readings_);
  decode_.emplace(std::move(generator), clock_, Decode::TickHandler());
}

}  // namespace kelvasi
