// SPDX-License-Identifier: Apache-2.0
// kelvasictl redact: a capture without what says of whom it is.
#include <memory>

#include "Tools/Kelvasictl/Redact.h"
#include "Tools/Kelvasictl/StandardStreams.h"
#include "Tools/Kelvasictl/ToolError.h"
#include "Tools/Kelvasictl/Verb.h"

namespace kelvasi {

namespace {

constexpr auto footer =
    R"(What identifies the subscriber or the device is blanked where it stands, and unless cells are kept, what says which
cell or area it was; every other row stays as it was. Docs/redaction.md lists it. The file is then searched for all
that was removed from it, and is left only when nothing is found.)";

}  // namespace

Action declareRedact(OptionSet verb) {
  const auto options = std::make_shared<RedactOptions>();
  verb.add("IN", options->input, "a pcap, pcapng or DLF file or a snapshot").required();
  verb.add("OUT", options->output, "a new file of the same kind").required();
  options->addTo(verb);
  verb.setFooter(footer);
  return [options](MessageTally&) { return redact(*options); };
}

}  // namespace kelvasi
