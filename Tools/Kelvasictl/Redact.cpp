// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/Redact.h"

#include <array>
#include <vector>

#include "Capture/CaptureRedaction.h"
#include "Capture/InputBytes.h"
#include "Capture/PlistBeginning.h"
#include "LogGenerator/LogGenerator.h"
#include "Platform/Nettle/HmacSha256.h"
#include "Platform/Posix/Files.h"
#include "Platform/Posix/OutputFile.h"
#include "Redaction/IdentitySearch.h"
#include "Redaction/PieceValue.h"
#include "Telvon/TechnologyName.h"
#include "Tools/ExitStatus.h"
#include "Tools/Kelvasictl/StandardStreams.h"
#include "Tools/Kelvasictl/ToolError.h"

namespace kelvasi {

namespace {

constexpr std::size_t shortestKey = 16;
constexpr std::size_t longestKey = 4096;

std::vector<RowCatalog> allCatalogs(const Platform& platform) {
  std::vector<RowCatalog> catalogs;
  for (const std::string_view technology : technologyIds())
    LogGenerator::generatorFromTechnology(technology, platform)->describe(catalogs.emplace_back());
  return catalogs;
}

std::unique_ptr<KeyedHash> hashFrom(const std::string& keyFile) {
  if (keyFile.empty()) return nullptr;
  FileContents key = readFile(keyFile, longestKey);
  if (key.error) throw ToolError(*key.error);
  if (key.bytes.size() < shortestKey)
    throw ToolError(keyFile + ": a key has at least " + std::to_string(shortestKey) + " bytes");
  return std::make_unique<HmacSha256>(std::move(key.bytes));
}

void checkWritten(const OutputFile& file) {
  if (file.error()) throw ToolError(*file.error());
}

// One hit, and there is to be no file.
class FileSearch {
 public:
  FileSearch(const std::string& path, const RemovedIdentities& removed) : path_(path), search_(removed) {}

  void run() {
    InputBytes input(path_);
    const bool isPlist = beginsAsPlist(input);
    Bytes block(std::size_t{1} << 20);
    Bytes document;
    for (std::ptrdiff_t count = 0; (count = input.read(block)) > 0;) {
      const auto piece = std::span(block).first(static_cast<std::size_t>(count));
      look(piece);
      if (isPlist) document.insert(document.end(), piece.begin(), piece.end());
    }
    if (input.fault()) throw ToolError(input.fault()->text());
    forEachPiece(document, [this](const PlistPiece& piece) { look(dataIn(piece)); });
    if (search_.notLookedFor() > 0)
      complain(std::to_string(search_.notLookedFor()) +
               " of the identities removed are too short to be searched for");
  }

 private:
  void look(std::span<const std::uint8_t> bytes) {
    if (search_.look(bytes)) throw ToolError(path_ + ": an identity is still in it; no file is left");
  }

  const std::string& path_;
  IdentitySearch search_;
};

struct Said {
  std::uint64_t RedactionCounts::*count;
  const char* what;
};
constexpr std::array said{
    Said{&RedactionCounts::identities, "identities of subscriber and device"},
    Said{&RedactionCounts::places, "places"},
    Said{&RedactionCounts::unknownValues, "values under names that nobody knows"},
    Said{&RedactionCounts::unknownMessages, "messages and blocks that nobody knows"},
    Said{&RedactionCounts::unreadable, "messages or parts that could not be read"},
};

std::string summary(const RedactionCounts& counts, bool isBlank) {
  std::string text;
  for (const Said& each : said) {
    if (counts.*each.count == 0) continue;
    text += (text.empty() ? "" : ", ") + std::to_string(counts.*each.count) + " " + each.what;
  }
  if (text.empty()) return "nothing was to be removed";
  return (isBlank ? "blanked: " : "replaced or blanked: ") + text;
}

}  // namespace

void RedactOptions::addTo(OptionSet verb) {
  verb.addFlag("--keep-cells", choice.keepsCells, "leave identities of cells and areas as they are");
  verb.add("--pseudonyms", keyFile,
           "replace identities by pseudonyms, the same for the same key; a file of 16 to 4096 bytes")
      .type("KEYFILE");
  verb.addFlag("--keep-unknown", choice.keepsUnknown,
               "leave what no decoder knows as it is, whatever it may hold");
}

Redaction::Redaction(const RedactOptions& options)
    : surroundings_(SurroundingsOptions()),
      hash_(hashFrom(options.keyFile)),
      replacement_(hash_.get()),
      messages_(allCatalogs(surroundings_.platform()), surroundings_.plists, replacement_, options.choice) {}

bool Redaction::redact(const std::string& input, const std::string& output) {
  OutputFile file(output, OutputFile::Existing::stays);
  checkWritten(file);
  bool isAnything = false;
  const auto fault = redactCapture(input, messages_, [&](std::span<const std::uint8_t> bytes) {
    isAnything = true;
    return file.append(bytes);
  });
  checkWritten(file);
  if (fault && !isAnything) throw ToolError(fault->text());
  if (fault) complain(fault->text());
  FileSearch(output, messages_.removed()).run();
  file.publish();
  file.close();
  checkWritten(file);
  return !fault;
}

int redact(const RedactOptions& options) {
  if (options.output == "-")
    throw ToolError("the file is searched when it is written: it cannot be a stream");
  Redaction redaction(options);
  const bool isWhole = redaction.redact(options.input, options.output);
  complain(options.output + ": " + summary(redaction.messages().counts(), options.keyFile.empty()));
  return isWhole ? exitSuccess : exitFault;
}

}  // namespace kelvasi
