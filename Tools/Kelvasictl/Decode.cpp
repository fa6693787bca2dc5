#include "Tools/Kelvasictl/Decode.h"

namespace kelvasi {

void Decode::take(CaptureReader& capture) {
  while (const auto message = capture.next()) {
    if (const auto time = schedule_.tickBefore(message->arrival)) tick(*time);
    update(message->bytes);
  }
}

void Decode::finish() {
  if (const auto time = schedule_.lastTick()) tick(*time);
}

void Decode::tick(TickSchedule::Time time) {
  display_ = generate();
  if (onTick_) onTick_(time, display_);
}

}  // namespace kelvasi
