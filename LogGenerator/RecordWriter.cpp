// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/RecordWriter.h"

#include <algorithm>

namespace kelvasi {

namespace {

bool fits(const Field& field, std::int64_t value) {
  const std::int64_t span = std::int64_t{1} << field.width;
  return field.isSigned ? value >= -span / 2 && value < span / 2 : value >= 0 && value < span;
}

void setBit(Bytes& bytes, std::size_t bit, bool on) {
  const auto mask = static_cast<std::uint8_t>(1u << (bit % 8));
  std::uint8_t& byte = bytes[bit / 8];
  byte = static_cast<std::uint8_t>(on ? byte | mask : byte & ~mask);
}

}  // namespace

Bytes recordHeader(LogCode logCode) {
  Bytes header(RecordView::headerSize);
  header[0] = logCode >= extraLogCodes ? 0xFF : 1;
  header[3] = static_cast<std::uint8_t>(logCode);
  header[4] = static_cast<std::uint8_t>(logCode >> 8);
  return header;
}

RecordWriter::RecordWriter(LogCode logCode, std::span<const Field> layout, std::size_t length)
    : layout_(layout), bytes_(recordHeader(logCode)) {
  padTo(length);
}

RecordWriter::RecordWriter(std::span<const Field> layout, std::size_t length)
    : layout_(layout), bytes_(length) {}

RecordWriter& RecordWriter::set(std::string_view name, std::int64_t value) {
  const auto field = std::ranges::find(layout_, name, &Field::name);
  if (field == layout_.end()) throw std::out_of_range("no field " + std::string(name));
  if (!fits(*field, value))
    throw std::out_of_range(std::to_string(value) + " does not fit " + std::string(name));
  padTo((field->endBit() + 7) / 8);
  auto raw = static_cast<std::uint64_t>(value);
  if (field->isBigEndian) raw = ((raw & 0xFF) << 8) | ((raw >> 8) & 0xFF);
  for (unsigned bit = 0; bit < field->width; ++bit)
    setBit(bytes_, field->firstBit() + bit, ((raw >> bit) & 1) != 0);
  return *this;
}

RecordWriter& RecordWriter::append(std::span<const std::uint8_t> bytes) {
  bytes_.insert(bytes_.end(), bytes.begin(), bytes.end());
  return *this;
}

RecordWriter& RecordWriter::padTo(std::size_t length) {
  if (bytes_.size() < length) bytes_.resize(length);
  return *this;
}

}  // namespace kelvasi
