// SPDX-License-Identifier: MIT
// Binary property lists, rule by rule.
#include <gtest/gtest.h>

#include <string>
#include <string_view>
#include <vector>

#include "tests/property_list/binary_file.hpp"
#include "tests/property_list/reading.hpp"

namespace qz::toolkit {
namespace {

using namespace std::string_literals;

std::string dumpOfObjects(std::vector<std::string> objects) {
  return dumpOf(BinaryFile{.objects = std::move(objects)}.bytes());
}

TEST(BinaryReader, TakesScalars) {
  const struct {
    std::string object;
    std::string_view dump;
  } cases[] = {
      {"\x00"s, "{\"null\":0}"},
      {"\x08", "false"},
      {"\x09", "true"},
      {"\x01", refused},
      {"\x0A", refused},
      {"\x0C", refused},
      {"\x0E"s + std::string(16, 'u'), refused},
      {"\x0F", refused},
      {"\x10\xFF", "{\"int\":\"255\"}"},
      {"\x11\xFF\xFE", "{\"int\":\"65534\"}"},
      {"\x12\x80\x00\x00\x00"s, "{\"int\":\"2147483648\"}"},
      {"\x13\xFF\xFF\xFF\xFF\xFF\xFF\xFF\xFE", "{\"int\":\"-2\"}"},
      {"\x14" + std::string(7, '\x11') + "\x22\x80" + std::string(7, '\0'),
       "{\"int\":\"9223372036854775808\"}"},
      {"\x15" + std::string(32, '\0'), refused},
      {"\x13\x00"s, refused},
      {"\x22\x3D\xCC\xCC\xCD", "{\"real\":\"0.10000000149011612\",\"w\":32}"},
      {"\x23\x3F\xB9\x99\x99\x99\x99\x99\x9A", "{\"real\":\"0.10000000000000001\",\"w\":64}"},
      {"\x23\xFF\xF8\x00\x00\x00\x00\x00\x00"s, "{\"real\":\"nan\",\"w\":64}"},
      {"\x20\x00"s, refused},
      {"\x21\x00\x00"s, refused},
      {"\x24" + std::string(16, '\0'), refused},
      {"\x33\x3F\xF8\x00\x00\x00\x00\x00\x00"s, "{\"date\":\"1.5\"}"},
      {"\x32\x00\x00\x00\x00"s, refused},
      {"\x30\x00"s, refused},
      {"\x34" + std::string(16, '\0'), refused},
      {"\x80\x07", "{\"uid\":7}"},
      {"\x83\xFF\xFF\xFF\xFF", "{\"uid\":4294967295}"},
      {"\x84\x01\x00\x00\x00\x00"s, refused},
      {"\x84\x00\x00\x00\x00\x09"s, "{\"uid\":9}"},
      {"\x8F\x99" + std::string(14, '\0') + "\x05", "{\"uid\":5}"},  // the low 64 bits
      {"\x8F" + std::string(15, '\0'), refused},
      {"\x70", refused},
      {"\x90", refused},
      {"\xB0", refused},
      {"\xE0", refused},
      {"\xF0", refused},
  };
  for (const auto& [object, dump] : cases) {
    EXPECT_EQ(dumpOfObjects({object}), dump) << testing::PrintToString(object);
  }
}

TEST(BinaryReader, TakesTextAndBytes) {
  const struct {
    std::string object;
    std::string dump;
  } cases[] = {
      {"\x40", "{\"data\":\"\"}"},
      {"\x42\x00\xFF"s, "{\"data\":\"00ff\"}"},
      {"\x43"
       "ab",
       std::string(refused)},
      {"\x4F\x10\x02"
       "ab",
       "{\"data\":\"6162\"}"},
      {"\x4F\x14" + std::string(15, '\0') + "\x01z", "{\"data\":\"7a\"}"},
      {"\x4F\x15" + std::string(31, '\0') + "\x01z", "{\"data\":\"7a\"}"},
      {"\x4F\x22\x00\x00\x00\x01z"s, std::string(refused)},
      {"\x4F", std::string(refused)},
      {"\x4F\x10", std::string(refused)},
      {"\x4F\x13\xFF\xFF\xFF\xFF\xFF\xFF\xFF\xFF", std::string(refused)},
      {"\x4F\x13\x7F\xFF\xFF\xFF\xFF\xFF\xFF\xFF", std::string(refused)},
      {"\x50", "\"\""},
      {"\x52"
       "ab",
       "\"ab\""},
      {"\x52\xE9\x80", "\"\\u00e9\\u0080\""},
      {"\x5F\x10\x14" + std::string(20, 'q'), "\"" + std::string(20, 'q') + "\""},
      {"\x61\x26\x3A", "\"\\u263a\""},
      {"\x62\xD8\x3D\xDE\x00"s, "\"\\ud83d\\ude00\""},
      {"\x62\xDE\x00\xD8\x3D"s, "\"\\ude00\\ud83d\""},
      {"\x61\xFE\xFF", "\"\\ufeff\""},
      {"\x60", std::string(refused)},
      {"\x6F\x10\x00"s, std::string(refused)},
      {"\x62\x00"
       "a\x00"s,
       std::string(refused)},
  };
  for (const auto& [object, dump] : cases) {
    EXPECT_EQ(dumpOfObjects({object}), dump) << testing::PrintToString(object);
  }
}

TEST(BinaryReader, TakesCollections) {
  const std::string k = "\x51k";
  const std::string v = "\x51v";
  const struct {
    std::vector<std::string> objects;
    std::string_view dump;
  } cases[] = {
      {{"\xA0"}, "[]"},
      {{"\xA2\x01\x01", k}, "[\"k\",\"k\"]"},
      {{"\xAF\x10\x02\x01\x02", k, v}, "[\"k\",\"v\"]"},
      {{"\xA2\x01", k}, refused},  // the second reference would be the next object's marker
      {{"\xA1\x02", k}, refused},
      {{"\xA1"}, refused},
      {{"\xC0"}, "{\"set\":[]}"},
      {{"\xC3\x02\x01\x02", k, v}, "{\"set\":[\"k\",\"v\"]}"},
      {{"\xC2\x01\x02", k, k}, "{\"set\":[\"k\"]}"},
      {{"\xD0"}, "{\"dict\":[]}"},
      {{"\xD1\x01\x02", k, v}, "{\"dict\":[[\"k\",\"v\"]]}"},
      {{"\xD1\x01", k}, refused},
      {{"\xD2\x01\x01\x01\x02", k, v}, "{\"dict\":[[\"k\",\"k\"]]}"},
      {{"\xD2\x01\x02\x03\x03", "\x10\x01", "\x23\x3F\xF0\0\0\0\0\0\0"s, v},
       "{\"dict\":[[{\"int\":\"1\"},\"v\"]]}"},
      {{"\xD1\x01\x01", "\x00"s}, "{\"dict\":[[{\"null\":0},{\"null\":0}]]}"},
      {{"\xD1\x01\x01", "\x09"}, "{\"dict\":[[true,true]]}"},
      {{"\xD1\x01\x01", "\x41z"}, "{\"dict\":[[{\"data\":\"7a\"},{\"data\":\"7a\"}]]}"},
      {{"\xD1\x01\x01", "\x80\x05"}, "{\"dict\":[[{\"uid\":5},{\"uid\":5}]]}"},
      {{"\xD1\x01\x01", "\x33\0\0\0\0\0\0\0\0"s},
       "{\"dict\":[[{\"date\":\"0\"},{\"date\":\"0\"}]]}"},
      {{"\xD1\x01\x02", "\xA0", v}, refused},
      {{"\xD1\x01\x02", "\xC0", v}, refused},
      {{"\xD1\x01\x02", "\xD0", v}, refused},
      {{"\xD1\x01\x02",
        "\x56"
        "CF$UID",
        "\x10\x07"},
       "{\"dict\":[[\"CF$UID\",{\"int\":\"7\"}]]}"},
      {{"\xA1\x00"s}, refused},
      {{"\xA1\x01", "\xA1\x00"s}, refused},
      {{"\xD1\x01\x00"s, k}, refused},
      {{"\xA3\x01\x02\x01", "\xA1\x02", k}, "[[\"k\"],\"k\",[\"k\"]]"},
  };
  for (const auto& [objects, dump] : cases) {
    EXPECT_EQ(dumpOfObjects(objects), dump) << testing::PrintToString(objects);
  }
}

TEST(BinaryReader, SharesObjects) {
  const auto array = asArray(
      readPropertyList(BinaryFile{.objects = {"\xA2\x01\x01", "\xA1\x02", "\x51k"}}.bytes()).value);
  EXPECT_TRUE(array->objectAtIndex(0) == array->objectAtIndex(1));
}

TEST(BinaryReader, TakesSizesFromOneToSixteen) {
  const std::string value = "\x51v";
  for (std::size_t size = 1; size <= 16; ++size) {
    // Bytes above the low 64 bits are ignored.
    const std::size_t ignored = size > 8 ? size - 8 : 0;
    const std::string reference =
        "\xA1" + std::string(ignored, '\x77') + std::string(size - ignored - 1, '\0') + "\x01";
    const BinaryFile references{.objects = {reference, value}, .referenceSize = size};
    EXPECT_EQ(dumpOf(references.bytes()), "[\"v\"]") << size;
    const BinaryFile offsets{.objects = {"\xA1\x01", value}, .offsetSize = size};
    EXPECT_EQ(dumpOf(offsets.bytes()), "[\"v\"]") << size;
  }
  for (const std::size_t size : {0U, 17U, 255U}) {
    const std::string reference = "\xA1" + std::string(size == 0 ? 0 : size - 1, '\0') + "\x01";
    EXPECT_EQ(dumpOf(BinaryFile{.objects = {reference, value}, .referenceSize = size}.bytes()),
              refused);
  }
  EXPECT_EQ(dumpOf(BinaryFile{.objects = {"\xA1\x01", value}, .offsetSize = 17}.bytes()), refused);
}

TEST(BinaryReader, WantsNumbersThatAreLargeEnough) {
  const auto withObjects = [](std::size_t count) {
    return BinaryFile{.objects = std::vector<std::string>(count, "\x09")}.bytes();
  };
  EXPECT_EQ(dumpOf(withObjects(255)), "true");
  EXPECT_EQ(dumpOf(withObjects(256)), refused);
  const auto withTableAt = [](std::size_t offset) {
    return BinaryFile{.objects = {"\x09" + std::string(offset - 9, 'x')}, .offsetSize = 1}.bytes();
  };
  EXPECT_EQ(dumpOf(withTableAt(255)), "true");
  EXPECT_EQ(dumpOf(withTableAt(256)), refused);
}

TEST(BinaryReader, ChecksTheOffsetTable) {
  const auto withOffsets = [](const std::vector<std::uint64_t>& offsets) {
    return dumpOf(BinaryFile{.objects = {"\xA1\x01", "\x09", "\x08"}, .offsets = offsets}.bytes());
  };
  EXPECT_EQ(withOffsets({8, 10, 11}), "[true]");
  EXPECT_EQ(withOffsets({8, 11, 10}), "[false]");
  EXPECT_EQ(withOffsets({8, 10, 7}), "[true]");  // below the objects, but unused
  EXPECT_EQ(withOffsets({8, 7, 10}), refused);
  EXPECT_EQ(withOffsets({8, 10, 12}), refused);  // at the table's start, refused though unused
  EXPECT_EQ(withOffsets({8, 10, 0xFFFF}), refused);
  EXPECT_EQ(withOffsets({0, 10, 11}), refused);
}

TEST(BinaryReader, ChecksHeaderAndTrailer) {
  const BinaryFile good{.objects = {"\x09"}};
  const std::string bytes = good.bytes();
  EXPECT_EQ(dumpOf(bytes), "true");
  for (const char* header : {"bplist01", "bplist0x", "bplist0\xFF"}) {
    EXPECT_EQ(dumpOf(BinaryFile{.objects = {"\x09"}, .header = header}.bytes()), "true") << header;
  }
  for (const char* header : {"bplist10", "Bplist00", "bplist 0"}) {
    EXPECT_EQ(dumpOf(BinaryFile{.objects = {"\x09"}, .header = header}.bytes()), refused) << header;
  }
  EXPECT_EQ(dumpOf(BinaryFile{.objects = {"\x09"}, .topObject = 1}.bytes()), refused);
  EXPECT_EQ(dumpOf(BinaryFile{.objects = {"\x09"}, .moreObjects = 1}.bytes()), refused);
  EXPECT_EQ(dumpOf(BinaryFile{.objects = {}}.bytes()), refused);
  EXPECT_EQ(dumpOf(bytes + "\0"s), refused);
  // (Nine bytes, the header and the object's byte, a tab, are a valid old-style string.)
  for (std::size_t size = 10; size < bytes.size(); ++size) {
    EXPECT_EQ(dumpOf(bytes.substr(0, size)), refused) << size;
  }
}

TEST(BinaryReader, TakesDeepNestingUpToALimit) {
  const auto arrays = [](std::size_t depth) {
    BinaryFile file{.objects = {}, .referenceSize = 2};
    for (std::size_t i = 1; i < depth; ++i) {
      file.objects.emplace_back("\xA1");
      binary::appendNumber(file.objects.back(), i, 2);
    }
    file.objects.emplace_back("\xA0");
    return dumpOf(file.bytes());
  };
  EXPECT_EQ(arrays(513), repeated("[", 513) + repeated("]", 513));
  EXPECT_EQ(arrays(514), refused);
}

}  // namespace
}  // namespace qz::toolkit
