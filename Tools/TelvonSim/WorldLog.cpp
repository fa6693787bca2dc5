// SPDX-License-Identifier: Apache-2.0
#include "Tools/TelvonSim/WorldLog.h"

#include <cmath>
#include <nlohmann/json.hpp>

namespace kelvasi {

namespace {

using Json = nlohmann::ordered_json;

double rounded(double value) {
  return std::round(value * 1000) / 1000;
}

Json jsonOf(const sim::TrueCell& cell) {
  Json json = Json::object();
  if (cell.now.level) json["level"] = rounded(*cell.now.level);
  json["quality"] = rounded(cell.now.quality);
  if (!cell.average) return json;
  if (cell.average->level) json["average_level"] = rounded(*cell.average->level);
  json["average_quality"] = rounded(cell.average->quality);
  return json;
}

}  // namespace

WorldLog::WorldLog(const std::string& path, const Clock& clock)
    : clock_(clock), file_(path, OutputFile::Existing::stays) {
  file_.publish();
}

void WorldLog::tell(const sim::TrueCells& cells) {
  Json line{{"time", rounded(clock_.now().secondsSince1970)},
            {"serving", Json::array()},
            {"cells", Json::object()}};
  for (const sim::TrueCell& cell : cells) {
    const std::string name = textOf(cell.identity);
    if (cell.isServing) line["serving"].push_back(name);
    line["cells"][name] = jsonOf(cell);
  }
  const std::string text = line.dump() + "\n";
  file_.append({reinterpret_cast<const std::uint8_t*>(text.data()), text.size()});
}

}  // namespace kelvasi
