// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/CaptureWork.h"

#include <atomic>

#include "Tools/Kelvasictl/Spool.h"
#include "Tools/Kelvasictl/StandardStreams.h"
#include "Tools/Kelvasictl/WorkInOrder.h"

namespace kelvasi {

namespace {

// What a capture has to say until it is its turn.
struct Piece {
  Spool printed;
  std::vector<std::string> complaints;
};

// Ends the work on a capture whose output nobody takes any more.
struct Abandoned {};

void say(Piece& piece) {
  piece.printed.giveTo(printOut);
  for (const std::string& line : piece.complaints) complain(line);
  piece = Piece();
}

}  // namespace

void workOnCaptures(const std::vector<std::string>& captures, unsigned jobs, const CaptureWork& work) {
  Progress progress(captures, work.progress);
  std::atomic<bool> isAbandoned = false;
  const auto advance = [&](std::uint64_t messages, std::uint64_t bytes) {
    if (isAbandoned) throw Abandoned();
    progress.add(messages, bytes);
  };
  std::vector<Piece> pieces(captures.size());
  const auto outputOf = [&](Piece& piece) -> CaptureOutput {
    if (jobs <= 1) return {printOut, complain, advance};
    return {[&piece](std::string_view text) { piece.printed.add(text); },
            [&piece](const std::string& line) { piece.complaints.push_back(line); }, advance};
  };
  workInOrder(
      pieces.size(), jobs, [&](std::size_t at) { work.work(at, outputOf(pieces[at])); },
      [&](std::size_t at) {
        try {
          say(pieces[at]);
          work.deliver(at);
        } catch (...) {
          isAbandoned = true;
          throw;
        }
      });
}

}  // namespace kelvasi
