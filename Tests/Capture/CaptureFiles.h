// SPDX-License-Identifier: Apache-2.0
// Captures written by hand and what reading them gives.
#pragma once

#include <string>
#include <vector>

#include "Capture/CaptureReader.h"
#include "Platform/Plist/LibplistSerialiser.h"
#include "Platform/Posix/Files.h"
#include "Tests/Platform/Posix/Surroundings.h"
#include "Tests/Support/HexBytes.h"

namespace kelvasi::test {

inline Bytes operator+(Bytes left, const Bytes& right) {
  left.insert(left.end(), right.begin(), right.end());
  return left;
}

inline Bytes bytesOf(std::string_view text) {
  return Bytes(text.begin(), text.end());
}

struct ReadCapture {
  std::vector<Bytes> messages;
  std::vector<std::int64_t> arrivals;  // nanoseconds since 1970
  std::optional<CaptureFault> fault;
  std::vector<std::string> complaints;
};

inline ReadCapture readCapture(const std::string& path) {
  ReadCapture capture;
  const auto reader = openCapture(path, LibplistSerialiser());
  while (const auto message = reader->next()) {
    capture.messages.emplace_back(message->bytes.begin(), message->bytes.end());
    capture.arrivals.push_back(message->arrival.count());
  }
  capture.fault = reader->fault();
  capture.complaints = reader->complaints();
  return capture;
}

// A directory for one test's files.
class CaptureDirectory {
 public:
  std::string write(const std::string& name, const Bytes& bytes) const {
    std::filesystem::remove(path(name));  // replacing waits for the disk
    if (const FileError error = writeFile(path(name), bytes)) throw std::runtime_error(*error);
    return path(name);
  }
  std::string path(const std::string& name) const { return directory_.file(name); }

 private:
  testing::TemporaryDirectory directory_;
};

}  // namespace kelvasi::test
