// SPDX-License-Identifier: MIT
// Malicious or meaningless bytes: reading them ends soon, with a value or a refusal.
#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <iterator>
#include <random>
#include <string>
#include <vector>

#include "tests/end_of_memory.hpp"
#include "tests/property_list/binary_file.hpp"
#include "tests/property_list/reading.hpp"

namespace qz::toolkit {
namespace {

using namespace std::literals;

std::string reasonFor(std::string_view bytes) {
  const ReadResult result = readPropertyList(bytes);
  return result.refusal ? result.refusal->reason : "";
}

/// Returns the contents of the files in tests/data/property-lists of at most `most` bytes.
std::vector<std::string> samples(std::size_t most) {
  std::vector<std::string> samples;
  const std::string folder = std::string(QZ_TEST_DATA) + "/property-lists";
  for (const auto& entry : std::filesystem::recursive_directory_iterator(folder)) {
    if (!entry.is_regular_file() || entry.file_size() > most) continue;
    std::ifstream file(entry.path(), std::ios::binary);
    samples.emplace_back(std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>());
  }
  return samples;
}

/// Reads arbitrary bytes, and expects either a sound value or a refusal with a description.
void expectValueOrRefusal(std::string_view bytes) {
  const ReadResult result = readPropertyList(bytes);
  ASSERT_NE(result.value.pointer() == nullptr, !result.refusal) << testing::PrintToString(bytes);
  if (result.value) {
    EXPECT_FALSE(canonicalDump(*result.value).empty());
  } else {
    EXPECT_FALSE(result.refusal->description().empty());
  }
}

/// Reads every beginning of a file, each where readable memory ends.
void cutAnywhere(std::string_view file) {
  EndOfMemory memory;
  for (std::size_t size = 0; size <= file.size(); ++size) {
    expectValueOrRefusal(memory.holding(file.substr(0, size)));
  }
}

TEST(HostileInput, CutShortAnywhere) {
  for (const std::string& sample : samples(400)) cutAnywhere(sample);
  cutAnywhere(
      plist("<array> <date>2001-01-01T00:00:00Z</date> <data>AQ==</data> <real>1e5</real>"
            "<string a=''>\xC3\xA9&#x20;&amp;<![CDATA[ ]]></string > <!-- c --> </array >"));
  cutAnywhere("{ a = \"\\n\\U0041\\101\"; /* c */ b = <01 02>; // c\n c; }");
  cutAnywhere("\xFE\xFF\0'\xD8\x3D\xDE\0\0'"s);
}

TEST(HostileInput, WhatFollowsTheEndDoesNotCount) {
  const struct {
    std::string_view file;
    std::string_view beyond;
  } cases[] = {
      {"<array>", " <true/></array>"},
      {"<array><true/> ", " <true/></array>"},
      {"<string>a", "b</string>"},
      {"<string>a</string", " >"},
      {"<integer>1", "2</integer>"},
      {"<date>2001", "-01-01T00:00:00Z</date>"},
      {"{ a = b", "; }"},
      {"'a", "b'"},
      {"<01", "02>"},
      {"\xFF\xFE<\0t\0r\0u\0e\0/\0>\0\x3D\xD8"sv, "\0\xDE"sv},
  };
  for (const auto& [file, beyond] : cases) {
    const std::string whole = std::string(file) + std::string(beyond);
    EXPECT_NE(dumpOf(whole), refused) << whole;
    EXPECT_EQ(dumpOf(std::string_view(whole).substr(0, file.size())), refused) << whole;
  }
}

TEST(HostileInput, WithBytesChanged) {
  std::mt19937 random(11);
  for (const std::string& sample : samples(400)) {
    for (int i = 0; i < 60 && !sample.empty(); ++i) {
      std::string bytes = sample;
      for (std::size_t changes = 1 + random() % 3; changes > 0; --changes) {
        constexpr std::string_view likely = "\0\x01\x0F\x7F\x80\xFF<>&;/!-[]\"'\\{}()=,0x"sv;
        bytes[random() % bytes.size()] = likely[random() % likely.size()];
      }
      expectValueOrRefusal(bytes);
    }
  }
}

TEST(HostileInput, NestedWithoutEnd) {
  constexpr std::size_t times = 300'000;
  for (const char* opening :
       {"<array>", "<dict><key>k</key>", "<plist>", "(", "{a=", "((", "<!--"}) {
    EXPECT_NE(reasonFor(repeated(opening, times)), "") << opening;
  }
}

TEST(HostileInput, CountsOfWhatIsNotThere) {
  const std::string huge = "\x13\x7F\xFF\xFF\xFF\xFF\xFF\xFF\xFF";
  for (const char* marker : {"\x4F", "\x5F", "\x6F", "\xAF", "\xCF", "\xDF"}) {
    EXPECT_EQ(reasonFor(BinaryFile{.objects = {marker + huge}}.bytes()),
              "the object reaches beyond the objects' space");
  }
  EXPECT_NE(reasonFor(BinaryFile{.objects = {"\x08"}, .moreObjects = 1ULL << 60}.bytes()), "");
}

TEST(HostileInput, SharedOverAndOverIsReadOnce) {
  // These would be 2^400 strings if they were not shared.
  BinaryFile file{.objects = {}, .referenceSize = 2};
  for (std::size_t i = 1; i <= 400; ++i) {
    file.objects.emplace_back("\xA2");
    binary::appendNumber(file.objects.back(), i, 2);
    binary::appendNumber(file.objects.back(), i, 2);
  }
  file.objects.emplace_back("\x51z");
  ValueRef<> value = readPropertyList(file.bytes()).value;
  for (int i = 0; i < 400; ++i) {
    ASSERT_TRUE(value->objectAtIndex(0) == value->objectAtIndex(1));
    value = value->objectAtIndex(0);
  }
  EXPECT_EQ(value->description(), "z");
}

TEST(HostileInput, OverlappingObjectsMayNotAddUp) {
  // Two hundred strings of a hundred thousand characters each, which share most of their bytes.
  constexpr std::size_t strings = 200;
  const std::string count = "\x5F\x12\x00\x01\x86\xA0"s;
  const std::string root = "\xAF\x10\xC8";
  std::string references;
  for (std::size_t i = 1; i <= strings; ++i) references += static_cast<char>(i);
  const std::string stringsBytes = repeated(count, strings) + std::string(100'000, 'x');
  BinaryFile bomb{.objects = {root + references, stringsBytes, "\x08"}, .offsetSize = 4};
  const std::size_t first = 8 + root.size() + references.size();
  bomb.offsets = {8};
  for (std::size_t i = 0; i < strings; ++i) bomb.offsets.push_back(first + count.size() * i);
  while (bomb.offsets.size() < 255) bomb.offsets.push_back(first + stringsBytes.size());
  EXPECT_EQ(reasonFor(bomb.bytes()), "the objects overlap too often");
}

TEST(HostileInput, ManyKeys) {
  std::string xml = "<dict>";
  for (int i = 0; i < 50'000; ++i) {
    xml +=
        "<key>" + std::to_string(i % 40'000) + "</key><integer>" + std::to_string(i) + "</integer>";
  }
  const auto root = dictionaryFromPropertyList(plist(xml + "</dict>"));
  EXPECT_EQ(root->count(), 40'000U);
  EXPECT_EQ(root->objectForKey("7")->intValue(), 40'007);
  EXPECT_EQ(root->objectForKey("39999")->intValue(), 39'999);
}

}  // namespace
}  // namespace qz::toolkit
