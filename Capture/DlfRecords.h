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
#pragma once

#include <cstddef>
#include <cstdint>
#include <span>
#include <vector>

namespace kelvasi {

struct DlfRecordPlace {
  std::size_t begin = 0;   // of what stands before the record
  std::size_t record = 0;  // of its length field
  std::size_t end = 0;
};

inline constexpr std::size_t dlfRecordHeaderSize = 12;

// The records in order, each beginning where the one before ends; they end early where nothing readable
// follows, and in any case where eight million places have been looked at.
std::vector<DlfRecordPlace> findDlfRecords(std::span<const std::uint8_t> file);

}  // namespace kelvasi
