// SPDX-License-Identifier: Apache-2.0
#include "Bench/Support/Baselines.h"

#include <algorithm>
#include <array>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <numeric>

namespace kelvasi::bench {

Work copying(Messages messages) {
  return [messages = std::move(messages)](benchmark::State& state) {
    Bytes target(std::ranges::max(messages, {}, &Bytes::size).size());
    std::size_t place = 0;
    for (auto _ : state) {
      std::memcpy(target.data(), messages[place].data(), messages[place].size());
      benchmark::DoNotOptimize(target.data());
      benchmark::ClobberMemory();
      if (++place == messages.size()) place = 0;
    }
    report(state, static_cast<std::uint64_t>(state.iterations()), 0);
  };
}

PlainRows::PlainRows(const PlistValue& display) {
  collect("", display);
}

void PlainRows::collect(const std::string& path, const PlistValue& value) {
  if (const auto* text = value.string()) {
    rows_.push_back(rowOf(path, *text));
  } else if (const auto* entries = value.dictionary()) {
    for (const auto& [key, entry] : *entries) collect(path + "/" + key, entry);
  } else if (const auto* elements = value.array()) {
    for (std::size_t place = 0; place < elements->size(); ++place)
      collect(path + "/" + std::to_string(place), elements->at(place));
  }
}

PlainRows::Row PlainRows::rowOf(std::string key, const std::string& text) {
  char* wholeEnd = nullptr;
  char* measuredEnd = nullptr;
  Row row{.key = std::move(key),
          .kind = Row::Kind::text,
          .whole = std::strtol(text.c_str(), &wholeEnd, 10),
          .measured = std::strtod(text.c_str(), &measuredEnd),
          .rest = text};
  if (wholeEnd == text.c_str()) return row;
  row.kind = *wholeEnd == '.' ? Row::Kind::measured : Row::Kind::whole;
  row.rest = *wholeEnd == '.' ? measuredEnd : wholeEnd;
  return row;
}

std::size_t PlainRows::bytes() const {
  return std::accumulate(rows_.begin(), rows_.end(), std::size_t{0}, [](std::size_t sum, const Row& row) {
    return sum + row.key.size() + row.rest.size();
  });
}

void PlainRows::show(std::map<std::string, std::string>& texts) const {
  std::array<char, 256> buffer;
  for (const Row& row : rows_) {
    switch (row.kind) {
      case Row::Kind::text:
        std::snprintf(buffer.data(), buffer.size(), "%s", row.rest.c_str());
        break;
      case Row::Kind::whole:
        std::snprintf(buffer.data(), buffer.size(), "%ld%s", row.whole, row.rest.c_str());
        break;
      case Row::Kind::measured:
        std::snprintf(buffer.data(), buffer.size(), "%4.2f%s", row.measured, row.rest.c_str());
        break;
    }
    texts[row.key.c_str()] = buffer.data();
  }
}

Work showing(std::function<std::vector<PlainRows>()> makeDisplays) {
  return [makeDisplays = std::move(makeDisplays)](benchmark::State& state) {
    const std::vector<PlainRows> displays = makeDisplays();
    std::map<std::string, std::string> texts;
    std::size_t place = 0;
    for (auto _ : state) {
      displays[place].show(texts);
      benchmark::ClobberMemory();
      if (++place == displays.size()) place = 0;
    }
    report(state, static_cast<std::uint64_t>(state.iterations()), 0);
  };
}

}  // namespace kelvasi::bench
