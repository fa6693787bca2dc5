// SPDX-License-Identifier: Apache-2.0
#include "Capture/UnpackedBytes.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <zlib.h>
#include <zstd.h>

#include "Tests/Capture/CaptureFiles.h"

namespace kelvasi {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using namespace test;

Bytes gzipped(Bytes bytes) {
  z_stream stream{};
  EXPECT_EQ(deflateInit2(&stream, 9, Z_DEFLATED, MAX_WBITS + 16, 8, Z_DEFAULT_STRATEGY), Z_OK);
  Bytes packed(::deflateBound(&stream, bytes.size()));
  stream.next_in = bytes.data();
  stream.avail_in = static_cast<uInt>(bytes.size());
  stream.next_out = packed.data();
  stream.avail_out = static_cast<uInt>(packed.size());
  EXPECT_EQ(::deflate(&stream, Z_FINISH), Z_STREAM_END);
  packed.resize(packed.size() - stream.avail_out);
  ::deflateEnd(&stream);
  return packed;
}

Bytes zstandard(Bytes bytes) {
  Bytes packed(ZSTD_compressBound(bytes.size()));
  packed.resize(ZSTD_compress(packed.data(), packed.size(), bytes.data(), bytes.size(), 3));
  return packed;
}

const Bytes fileHeader = hex("D4C3B2A1 0200 0400 00000000 00000000 00000400 93000000");

// Of bytes that do not pack well, so that the packed file has many places to be cut at.
Bytes captureOf(std::uint8_t count) {
  Bytes bytes = fileHeader;
  for (std::uint8_t number = 0; number < count; ++number) {
    bytes = bytes + hex("01000000 00000000 14000000 14000000");
    for (unsigned place = 0; place < 20; ++place)
      bytes.push_back(static_cast<std::uint8_t>(number * 83 + place * place * 31));
  }
  return bytes;
}

struct Packing {
  const char* name;
  const char* ending;
  Bytes (*pack)(Bytes);
};

void PrintTo(const Packing& packing, std::ostream* out) {
  *out << packing.name;
}

struct UnpackedBytesTest : ::testing::TestWithParam<Packing> {
  Bytes pack(Bytes bytes) const { return GetParam().pack(std::move(bytes)); }
  std::string write(const std::string& name, const Bytes& bytes) const {
    return directory.write(name + GetParam().ending, bytes);
  }
  std::string early() const { return "the " + std::string(GetParam().name) + " data end too early"; }

  CaptureDirectory directory;
  const std::vector<Bytes> messages = readCapture(directory.write("plain", captureOf(9))).messages;
};

INSTANTIATE_TEST_SUITE_P(Packings, UnpackedBytesTest,
                         ::testing::Values(Packing{"gzip", ".gz", gzipped},
                                           Packing{"zstd", ".zst", zstandard}),
                         [](const auto& packing) { return packing.param.name; });

TEST_P(UnpackedBytesTest, AreReadAsIfTheFileWereNotPacked) {
  for (const char* name : {"a.pcap", "whatever"}) {
    const ReadCapture capture = readCapture(write(name, pack(captureOf(9))));
    EXPECT_EQ(capture.messages, messages);
    EXPECT_EQ(capture.messages.size(), 9u);
    EXPECT_FALSE(capture.fault);
  }
}

TEST_P(UnpackedBytesTest, GoOnInTheNextPieceOfSeveral) {
  const Bytes whole = captureOf(9);
  const Bytes first(whole.begin(), whole.begin() + 100);
  const Bytes second(whole.begin() + 100, whole.end());
  const ReadCapture capture = readCapture(write("a.pcap", pack(first) + pack({}) + pack(second)));
  EXPECT_EQ(capture.messages, messages);
  EXPECT_FALSE(capture.fault);
}

TEST_P(UnpackedBytesTest, MayBeManyTimesAsManyAsThePacked) {
  const Bytes many = fileHeader + hex("01000000 00000000 00000400 00000400") + Bytes(262'144, 7);
  const ReadCapture capture = readCapture(write("a.pcap", pack(many)));
  EXPECT_THAT(capture.messages, ElementsAre(Bytes(262'144, 7)));
}

TEST_P(UnpackedBytesTest, OfACutFileAreReadUpToTheCut) {
  const Bytes packed = pack(captureOf(9));
  std::size_t before = 0;
  for (std::size_t size = 4; size < packed.size(); ++size) {
    const Bytes cut(packed.begin(), packed.begin() + static_cast<std::ptrdiff_t>(size));
    const std::string path = write("a.pcap", cut);
    const ReadCapture capture = readCapture(path);
    EXPECT_EQ(capture.messages,
              std::vector<Bytes>(messages.begin(),
                                 messages.begin() + static_cast<std::ptrdiff_t>(capture.messages.size())));
    EXPECT_GE(capture.messages.size(), before);
    before = capture.messages.size();
    ASSERT_TRUE(capture.fault) << size;
    EXPECT_EQ(capture.fault->text(), path + ": byte " + std::to_string(size) + ": " + early());
  }
}

TEST_P(UnpackedBytesTest, OfADamagedFileEndWithAFault) {
  const Bytes packed = pack(captureOf(9));
  for (std::size_t place = 4; place < packed.size(); ++place) {
    Bytes damaged = packed;
    damaged[place] ^= 0x55;
    // Not every byte matters: a gzip file's header has a time.
    const ReadCapture capture = readCapture(write("a.pcap", damaged));
    EXPECT_LE(capture.messages.size(), 9u);
    EXPECT_TRUE(capture.fault || capture.messages.size() == 9) << place;
  }
  const ReadCapture behind = readCapture(write("a.pcap", packed + bytesOf("something else")));
  EXPECT_EQ(behind.messages, messages);
  ASSERT_TRUE(behind.fault);
  // Where something else begins, or behind what of it looked right.
  EXPECT_THAT(*behind.fault->offset,
              ::testing::AllOf(::testing::Ge(packed.size()), ::testing::Le(packed.size() + 2)));
  EXPECT_THAT(behind.fault->reason,
              ::testing::StartsWith("damaged " + std::string(GetParam().name) + " data: "));
}

TEST_P(UnpackedBytesTest, HaveTheirOwnPlaces) {
  Bytes cut = captureOf(2);
  cut.pop_back();
  const std::string path = write("a.pcap", pack(cut));
  const ReadCapture capture = readCapture(path);
  EXPECT_THAT(capture.messages, ElementsAre(messages[0]));
  ASSERT_TRUE(capture.fault);
  EXPECT_THAT(capture.fault->text(),
              ::testing::StartsWith(path + ", unpacked: byte 60: truncated dump file"));
}

TEST_P(UnpackedBytesTest, OfADlfFileAreToldByItsName) {
  const Bytes dlf = hex("0D00 C0B0 0000000000000000 77");
  EXPECT_THAT(readCapture(write("a.dlf", pack(dlf))).messages,
              ElementsAre(hex("01 0D00 C0B0 0000000000000000 77")));
}

TEST_P(UnpackedBytesTest, OfASnapshotAreToldByItsNameAndItsContent) {
  const Bytes snapshot = bytesOf(
      "<plist><dict><key>Data</key><array><dict><key>DLF</key>"
      "<data>DQDAsAAAAAAAAAAAdw==</data></dict></array></dict></plist>");
  EXPECT_THAT(readCapture(write("a.kelvasi", pack(snapshot))).messages,
              ElementsAre(hex("01 0D00 C0B0 0000000000000000 77")));
  EXPECT_THAT(readCapture(write("anything", pack(snapshot))).messages,
              ElementsAre(hex("01 0D00 C0B0 0000000000000000 77")));
  const std::string empty = write("b.kelvasi", pack({}));
  EXPECT_EQ(readCapture(empty).fault->text(), empty + ", unpacked: byte 0: an empty file");
}

// What some programs put before the first frame: four bytes that every reader passes over.
TEST(UnpackedBytes, OfZstdMayBeginWithAFrameToSkip) {
  const CaptureDirectory directory;
  const Bytes packed = hex("502A4D18 04000000 11223344") + zstandard(captureOf(2));
  EXPECT_EQ(readCapture(directory.write("a.zst", packed)).messages.size(), 2u);
}

// A member with one stored block (RFC 1951, 3.2.4).
TEST(UnpackedBytes, OfGzipTypedByHand) {
  const CaptureDirectory directory;
  const Bytes packed = hex("1F8B 08 00 00000000 00 FF 01 0D00 F2FF") + hex("0D00 C0B0 0000000000000000 77") +
                       hex("2A6566A9 0D000000");
  const ReadCapture capture = readCapture(directory.write("a.dlf.gz", packed));
  EXPECT_THAT(capture.messages, ElementsAre(hex("01 0D00 C0B0 0000000000000000 77")));
  EXPECT_FALSE(capture.fault);
}

}  // namespace
}  // namespace kelvasi
