// SPDX-License-Identifier: Apache-2.0
#include "Capture/SnapshotReader.h"

#include <utility>

#include "Capture/PlistEnd.h"

namespace kelvasi {

namespace {

// Null where no entry holds one. Save puts it last.
const Bytes* dlfAmong(const PlistArray& entries) {
  const Bytes* dlf = nullptr;
  for (const PlistValue& entry : entries) {
    const PlistValue* value = entry.dictionary() ? entry.dictionary()->find("DLF") : nullptr;
    if (value && value->data() && !value->data()->empty()) dlf = value->data();
  }
  return dlf;
}

}  // namespace

SnapshotReader::SnapshotReader(InputBytes& input, const PlistSerialiser& plists) : name_(input.name()) {
  const Bytes document = input.readToEnd(largestFile, "a snapshot");
  fault_ = input.fault();
  if (fault_) return;
  if (const auto snapshot = plists.parse(document)) {
    open(*snapshot);
  } else if (endsTooEarly(document)) {
    fault_ = CaptureFault{name_, document.size(), "the property list ends too early"};
  } else {
    fail("no property list that can be read");
  }
}

void SnapshotReader::open(const PlistValue& snapshot) {
  const PlistDictionary* top = snapshot.dictionary();
  const PlistValue data = top ? top->get("Data") : PlistValue();
  // One that was saved before the baseband was known holds its time only.
  const bool holdsTimeOnly = !data && top && top->find("Timestamp");
  if (!data.array() && !holdsTimeOnly) return fail("no snapshot: there is no \"Data\" array in it");
  const Bytes* dlf = data.array() ? dlfAmong(*data.array()) : nullptr;
  if (!dlf) return fail("the snapshot holds no DLF and so no messages");
  dlf_.emplace("DLF", *dlf);
}

std::optional<CapturedMessage> SnapshotReader::next() {
  if (!dlf_) return std::nullopt;
  auto message = dlf_->next();
  if (!message && dlf_->fault()) fail(dlf_->fault()->text());
  return message;
}

void SnapshotReader::fail(std::string reason) {
  fault_ = CaptureFault{name_, std::nullopt, std::move(reason)};
}

}  // namespace kelvasi
