// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/ReadingChoice.h"

#include <fnmatch.h>

#include <algorithm>
#include <charconv>
#include <cmath>

namespace kelvasi {

namespace {

bool fits(const std::string& glob, const std::string& name) {
  return fnmatch(glob.c_str(), name.c_str(), FNM_NOESCAPE) == 0;
}

// Reads what a date and its time consist of, one part after the other.
class MomentReader {
 public:
  explicit MomentReader(std::string_view text) : rest_(text) {}

  int number(std::size_t digits) {
    int value = 0;
    const std::string_view text = rest_.substr(0, digits);
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value);
    isGood_ &= error == std::errc() && text.size() == digits && end == text.data() + digits && value >= 0;
    rest_.remove_prefix(text.size());
    return value;
  }
  bool takes(std::string_view characters) {
    if (rest_.empty() || characters.find(rest_.front()) == std::string_view::npos) return false;
    last_ = rest_.front();
    rest_.remove_prefix(1);
    return true;
  }
  void expect(std::string_view characters) { isGood_ &= takes(characters); }
  char last() const { return last_; }
  // Nanoseconds of the digits after a point.
  std::int64_t fraction() {
    std::int64_t value = 0;
    std::int64_t weight = 1'000'000'000;
    std::size_t digits = 0;
    for (; takes("0123456789"); ++digits) value += (last_ - '0') * (weight /= 10);
    isGood_ &= digits > 0;
    return value;
  }
  bool isAtEnd() const { return isGood_ && rest_.empty(); }
  void refuse() { isGood_ = false; }

 private:
  std::string_view rest_;
  bool isGood_ = true;
  char last_ = 0;
};

std::optional<Arrival> momentOfDate(const std::string& text) {
  using namespace std::chrono;
  MomentReader reader(text);
  const year year{reader.number(4)};
  reader.expect("-");
  const month month{static_cast<unsigned>(reader.number(2))};
  reader.expect("-");
  const day day{static_cast<unsigned>(reader.number(2))};
  reader.expect("Tt ");
  nanoseconds time = hours(reader.number(2));
  reader.expect(":");
  time += minutes(reader.number(2));
  reader.expect(":");
  time += seconds(reader.number(2));
  if (reader.takes(".")) time += nanoseconds(reader.fraction());
  reader.expect("Zz+-");
  if (const char sign = reader.last(); sign == '+' || sign == '-') {
    nanoseconds offset = hours(reader.number(2));
    reader.expect(":");
    offset += minutes(reader.number(2));
    time -= sign == '+' ? offset : -offset;
  }
  const year_month_day date(year, month, day);
  if (!reader.isAtEnd() || !date.ok()) return std::nullopt;
  return sys_days(date).time_since_epoch() + time;
}

std::optional<Arrival> momentOfSeconds(const std::string& text) {
  double seconds = 0;
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), seconds);
  constexpr double latest = 9e9;  // nanoseconds of it still fit
  if (error != std::errc() || end != text.data() + text.size() || !(std::fabs(seconds) < latest))
    return std::nullopt;
  return std::chrono::round<Arrival>(std::chrono::duration<double>(seconds));
}

void addMoment(OptionSet verb, const char* name, const char* help, std::optional<Arrival>& moment) {
  verb.addReader<std::string>(
          name,
          [name, &moment](const std::string& text) {
            moment = momentOf(text);
            if (!moment) throw WrongUsage(name, "\"" + text + "\" is no time");
          },
          help)
      .type("T");
}

}  // namespace

std::optional<Arrival> momentOf(const std::string& text) {
  const auto date = momentOfDate(text);
  return date ? date : momentOfSeconds(text);
}

void ReadingChoice::addTo(OptionSet verb) {
  verb.add("--select", globs_, "only readings whose path, section/row or quantity fits; with * ? and [...]")
      .type("GLOB")
      .oneValueEach();
  addMoment(verb, "--from", "only messages from then on, as 2024-03-05T14:07:09Z or seconds since 1970",
            from_);
  addMoment(verb, "--to", "only messages up to then", to_);
}

bool ReadingChoice::takes(const Reading& reading, const std::string& path) const {
  if (globs_.empty()) return true;
  const Quantity* const quantity = quantityOf(reading);
  const std::string id(quantity ? quantity->id : std::string_view());
  std::string row = reading.section ? reading.section->name + "/" : "";
  row += rowOf(reading);
  return std::ranges::any_of(globs_, [&](const std::string& glob) {
    return fits(glob, path) || fits(glob, row) || (quantity && fits(glob, id));
  });
}

}  // namespace kelvasi
