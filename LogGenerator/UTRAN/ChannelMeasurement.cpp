// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/UTRAN/ChannelMeasurement.h"

#include "LogGenerator/Exceptions.h"

namespace kelvasi::utran::channelMeasurement {

std::int64_t ratioOf(RecordView compositeChannel, std::size_t timeslot) {
  if (timeslot >= timeslots) throw ArrayOutOfBoundsException();
  return valueOf(compositeChannel, ratioLayout[timeslot]);
}

}  // namespace kelvasi::utran::channelMeasurement
