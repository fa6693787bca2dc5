// SPDX-License-Identifier: Apache-2.0
// A capture redacted into a new file, and the search for what was to be removed.
#pragma once

#include <memory>
#include <string>

#include "Platform/KeyedHash.h"
#include "Redaction/MessageRedactor.h"
#include "Redaction/Replacement.h"
#include "Tools/Kelvasictl/Surroundings.h"
#include "Tools/OptionSet.h"

namespace kelvasi {

struct RedactOptions {
  std::string input;
  std::string output;
  std::string keyFile;
  RedactionChoice choice;

  void addTo(OptionSet verb);
};

// Redacts the captures of a call, all with the same pseudonyms.
class Redaction {
 public:
  // Throws ToolError when there is no key in the key file.
  explicit Redaction(const RedactOptions& options);

  // Writes `output`, and removes it again where an identity is found in it. False when not all of the input
  // could be read, which is said. Throws ToolError.
  bool redact(const std::string& input, const std::string& output);
  const MessageRedactor& messages() const { return messages_; }

 private:
  OfflineSurroundings surroundings_;
  std::unique_ptr<KeyedHash> hash_;
  Replacement replacement_;
  MessageRedactor messages_;
};

// Returns the exit status; throws ToolError.
int redact(const RedactOptions& options);

}  // namespace kelvasi
