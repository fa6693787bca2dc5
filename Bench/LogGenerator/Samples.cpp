// SPDX-License-Identifier: Apache-2.0
#include "Bench/LogGenerator/Samples.h"

#include <algorithm>
#include <stdexcept>

#include "Bench/LogGenerator/C2K/C2KSamples.h"
#include "Bench/LogGenerator/GSM/GSMSamples.h"
#include "Bench/LogGenerator/LTE/LTESamples.h"
#include "Bench/LogGenerator/UTRAN/UTRANSamples.h"
#include "LogGenerator/RecordWriter.h"
#include "Platform/Plist/LibplistSerialiser.h"
#include "Telvon/Technology.h"

namespace kelvasi::bench {

namespace {

constexpr std::size_t recordsOfAKind = 64;

void fill(RecordWriter& record, std::span<const Field> layout, std::uint64_t below, Random& random) {
  for (const Field& field : layout) {
    const std::uint64_t values = std::uint64_t{1} << (field.isSigned ? field.width - 1 : field.width);
    record.set(field.name, static_cast<std::int64_t>(random.below(std::min(values, below))));
  }
}

Bytes entry(const SampleList& list, std::uint64_t below, Random& random) {
  RecordWriter writer(list.entries.layout);
  fill(writer, list.entries.layout, below, random);
  return writer.bytes();
}

// Entries may overlap: then what was written later stands.
void appendList(Bytes& record, const SampleList& list, std::size_t sizeBefore, const Sample& sample,
                Random& random) {
  const EntryList& entries = list.entries;
  for (std::size_t place = 0; place < list.size; ++place) {
    const Bytes bytes = entry(list, sample.below, random);
    const std::size_t at = entries.start + entries.bytesPerEntryBefore * sizeBefore + entries.stride * place;
    record.resize(std::max(record.size(), at + std::max(bytes.size(), entries.stride)));
    std::ranges::copy(bytes, record.begin() + static_cast<std::ptrdiff_t>(at));
  }
}

Bytes listRecord(LogCode logCode, const PlistValue& list) {
  const auto payload = LibplistSerialiser().serialiseXml(list);
  if (!payload) throw std::invalid_argument("no property list");
  return RecordWriter(logCode, {}).append(*payload).bytes();
}

}  // namespace

std::span<const Technology> technologies() {
  static const std::array all{
      Technology{"GSM/UMTS", kTelvonLogChannelTechnology_Orvane_GSM, gsmSamples()},
      Technology{"LTE", kTelvonLogChannelTechnology_Orvane_LTE, lteSamples()},
      Technology{"UTRAN", kTelvonLogChannelTechnology_Orvane_UTRAN2, utranSamples()},
      Technology{"CDMA", kTelvonLogChannelTechnology_Orvane_CDMA, c2kSamples()},
  };
  return all;
}

Bytes makeRecord(const Sample& sample, Random& random) {
  if (sample.payload) return listRecord(sample.logCode, sample.payload(random));
  if (sample.record) return sample.record(random);
  RecordWriter writer(sample.logCode, sample.layout, sample.length);
  fill(writer, sample.layout, sample.below, random);
  for (const FieldValue& fixed : sample.fixed) {
    if (!fixed.name.empty()) writer.set(fixed.name, fixed.value);
  }
  for (const SampleList& list : sample.lists) {
    if (list.size == 0) continue;
    writer.set(list.entries.count.name, static_cast<std::int64_t>(list.size - list.entries.uncounted));
  }
  Bytes record = writer.bytes();
  std::size_t sizeBefore = 0;
  for (const SampleList& list : sample.lists) {
    appendList(record, list, sizeBefore, sample, random);
    sizeBefore = list.size;
  }
  return record;
}

Messages recordsOf(const Sample& sample) {
  Random random;
  Messages records(recordsOfAKind);
  std::ranges::generate(records, [&] { return makeRecord(sample, random); });
  return records;
}

}  // namespace kelvasi::bench
