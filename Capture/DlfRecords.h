// SPDX-License-Identifier: Apache-2.0
// Where the records of a DLF file are.
//
// A record is a length (16 bits, little-endian, the whole record), a log code (16 bits), a time stamp (8
// bytes) and a payload. A plain DLF file is one record after another. A DLF file of a snapshot is not: it
// holds an interval's messages as they came, each with the log type in front of its record (and, with some
// daemons, a prefix of two bytes before that, the first of them 0x81), and only the first byte of each
// interval is missing. Nothing marks where an interval begins. So one of four things stands before a record:
//
//   nothing          a plain record, or the first of an interval
//   01 or FF         its log type
//   81 xx 01         prefix and log type (or 81 xx FF)
//   xx 01            the same as the first of an interval (or xx FF)
//
// A byte 01 or FF may be a log type or the low byte of a length; a wrong reading derails sooner or later, or
// takes several records for one long one. Of all readings of the whole file the one with the most records is
// taken, of those the one that gets furthest. A file is misread only where a wrong reading finds its way back
// to the right one with at least as many records.
//
// What follows a place decides how the bytes before it are read, so records are found once all readings that
// are still possible agree on them. One that is 6000 records behind another is given up. In a file made to be
// read in every possible way they may never agree: past 8 MiB, or half a million places, the reading with the
// most records so far is taken.
#pragma once

#include <cstddef>
#include <cstdint>
#include <deque>
#include <map>
#include <optional>
#include <span>

#include "Capture/ByteSource.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

// Places are counted from the beginning of the file.
struct DlfRecordPlace {
  std::uint64_t begin = 0;   // of what stands before the record
  std::uint64_t record = 0;  // of its length field
  std::uint64_t end = 0;
};

inline constexpr std::size_t dlfRecordHeaderSize = 12;

// The records in order, each beginning where the one before ends; they end early where nothing readable
// follows. Holds no more of the file than it takes.
class DlfRecordFinder {
 public:
  // `bytes` outlives it, and is read in blocks of this size. A fault of theirs is their end.
  explicit DlfRecordFinder(ByteSource& bytes, std::size_t blockSize = std::size_t{256} << 10);

  // Reads on until there are more records in found(). False when there are none.
  bool findMore();
  const std::deque<DlfRecordPlace>& found() const { return found_; }
  // Takes the first of found(). Its bytes last until findMore() is called.
  DlfRecordPlace take();
  std::span<const std::uint8_t> bytes(std::uint64_t begin, std::uint64_t end) const;

  // Once findMore() has returned false: where the last record ends, and the bytes read, which are more where
  // no record begins there.
  std::uint64_t end() const { return end_; }
  std::uint64_t bytesRead() const { return begin_ + held_.size(); }
  // How many bytes are kept.
  std::size_t held() const { return held_.size(); }

 private:
  // The best way found so far to read the file up to a place.
  struct Way {
    std::uint64_t records = 0;
    std::uint64_t from = 0;  // number of the step before
    std::uint8_t lead = 0;
  };
  // A place that was taken up. Steps are numbered in order of places.
  struct Step {
    std::uint64_t place = 0;
    Way way;
  };

  const Step& stepAt(std::uint64_t number) const { return steps_[number - root_]; }
  bool step();
  void followLeads(const Step& here, std::uint64_t number);
  bool isWorthSettling() const;
  std::uint64_t nextToSettle();
  std::uint64_t agreed() const;
  bool isTooMuch(std::uint64_t agreedStep) const;
  std::uint64_t halfOfBest() const;
  void dropOthersThan(std::uint64_t number);
  void settle(std::uint64_t number);
  void read();

  ByteSource& bytes_;
  std::size_t blockSize_;
  Bytes held_;
  std::uint64_t begin_ = 0;  // place of the first byte held
  bool isAtEnd_ = false;
  std::map<std::uint64_t, Way> ways_;  // to places still to be taken up
  std::deque<Step> steps_;
  std::uint64_t root_ = 0;         // number of the first of them; what leads to it is settled
  std::uint64_t end_ = 0;          // of what is settled
  std::size_t worthSettling_ = 0;  // with so many steps
  std::uint64_t best_ = 0;         // number of the step with the most records, of those the furthest
  std::deque<DlfRecordPlace> found_;
};

}  // namespace kelvasi
