#include "Capture/DlfRecords.h"

#include <algorithm>
#include <array>
#include <map>
#include <tuple>

#include "LogGenerator/RecordView.h"

namespace kelvasi {

namespace {

bool isLogType(std::uint8_t byte) {
  return byte == 0x01 || byte == 0xFF;
}

// What may stand before a record: its size, and whether the bytes at a place can be it.
struct Lead {
  std::size_t size;
  bool (*fits)(RecordView at);
};

constexpr std::array leads{
    Lead{1, [](RecordView at) { return isLogType(at.byteAt(0)); }},
    Lead{3, [](RecordView at) { return at.byteAt(0) == 0x81 && isLogType(at.byteAt(2)); }},
    Lead{0, [](RecordView) { return true; }},
    Lead{2, [](RecordView at) { return isLogType(at.byteAt(1)); }},
};

// The best way found so far to read the file up to a place.
struct Way {
  std::uint32_t records = 0;
  std::uint32_t from = 0;  // number of the step before, in order of places
  std::uint32_t lead = 0;
};

struct Step {
  std::size_t place = 0;
  Way way;
};

// A file made to be read in every possible way would take a step at each of its bytes.
constexpr std::size_t mostSteps = 8'000'000;

class Search {
 public:
  explicit Search(std::span<const std::uint8_t> file) : file_(file) { ways_[0] = {}; }

  std::vector<DlfRecordPlace> run() {
    while (!ways_.empty() && steps_.size() < mostSteps) {
      steps_.push_back({ways_.begin()->first, ways_.begin()->second});
      ways_.erase(ways_.begin());
      for (const Lead& lead : leads) tryLead(lead);
    }
    return best();
  }

 private:
  // Places are taken up in ascending order, so the last step's way cannot improve any more.
  void tryLead(const Lead& lead) {
    const auto& [place, way] = steps_.back();
    if (file_.size() - place < lead.size + dlfRecordHeaderSize) return;
    const RecordView here = RecordView(file_).from(place);
    const std::size_t length = here.u16(lead.size);
    if (!lead.fits(here) || length < dlfRecordHeaderSize) return;
    if (file_.size() - place - lead.size < length) return;
    Way& further = ways_[place + lead.size + length];
    if (further.records > way.records) return;
    further = {.records = way.records + 1,
               .from = static_cast<std::uint32_t>(steps_.size() - 1),
               .lead = static_cast<std::uint32_t>(lead.size)};
  }

  std::vector<DlfRecordPlace> best() const {
    const auto last = std::ranges::max_element(
        steps_, {}, [](const Step& step) { return std::tuple(step.way.records, step.place); });
    std::vector<DlfRecordPlace> records(last->way.records);
    for (const Step* step = &*last; step->way.records > 0; step = &steps_[step->way.from]) {
      const std::size_t begin = steps_[step->way.from].place;
      records[step->way.records - 1] = {.begin = begin, .record = begin + step->way.lead, .end = step->place};
    }
    return records;
  }

  std::span<const std::uint8_t> file_;
  std::map<std::size_t, Way> ways_;  // to places still to be taken up
  std::vector<Step> steps_;
};

}  // namespace

std::vector<DlfRecordPlace> findDlfRecords(std::span<const std::uint8_t> file) {
  return Search(file).run();
}

}  // namespace kelvasi
