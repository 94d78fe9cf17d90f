// SPDX-License-Identifier: MIT
// The table of formats: every format has one row, and the row's functions agree with each other.
#include "qz/property_list/formats.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <set>
#include <string>

#include "qz/property_list/canonical_dump.hpp"
#include "qz/property_list/collections.hpp"
#include "qz/property_list/reader.hpp"
#include "qz/property_list/scalars.hpp"
#include "tests/enumerators.hpp"

namespace qz::toolkit {
namespace {

ValueRef<> sample() {
  return Dictionary::make({{String::make("k"), Array::make({String::make("a")})}});
}

TEST(Formats, EveryFormatHasOneRow) {
  const auto all = enumerators<Format>();
  ASSERT_GE(all.size(), 3U);
  EXPECT_EQ(formats().size(), all.size());
  for (const Format format : all) {
    const auto rows = formats();
    const auto count = std::count_if(rows.begin(), rows.end(),
                                     [&](const auto& row) { return row.format == format; });
    EXPECT_EQ(count, 1) << "format " << static_cast<int>(format);
  }
}

TEST(Formats, ATextThatLooksLikeNoOtherFormatIsOfTheLast) {
  EXPECT_TRUE(formats().back().isText);
  EXPECT_TRUE(formats().back().looksLike(""));
}

TEST(Formats, NamesTitlesAndSuffixesDiffer) {
  std::set<std::string_view> words;
  for (const FormatRow& row : formats()) {
    EXPECT_EQ(&formatRow(row.format), &row);
    EXPECT_EQ(description(row.format), row.title);
    EXPECT_TRUE(words.insert(row.name).second) << row.name;
    EXPECT_TRUE(words.insert(row.title).second) << row.title;
    for (const auto suffix : row.suffixes) {
      EXPECT_TRUE(suffix.starts_with('.')) << suffix;
      EXPECT_TRUE(words.insert(suffix).second) << suffix;
    }
  }
}

TEST(Formats, AFileIsReadAsTheFormatInWhichItWasWritten) {
  int writers = 0;
  for (const FormatRow& row : formats()) {
    if (!row.write) continue;
    ++writers;
    const std::string file = row.write(sample());
    EXPECT_TRUE(row.looksLike(file)) << row.name;
    const ReadResult result = readPropertyList(file);
    ASSERT_TRUE(result.value) << row.name;
    EXPECT_EQ(result.format, row.format) << row.name;
    EXPECT_EQ(canonicalDump(*result.value), canonicalDump(*sample())) << row.name;
  }
  EXPECT_GE(writers, 2);
}

TEST(Formats, LooksChooseTheFormatThatARefusalNames) {
  const struct {
    std::string_view contents;
    Format format;
  } cases[] = {
      {"bplist00", Format::oldStyle},  // a string, which is not refused
      {std::string_view("bplist00\0", 9), Format::binary},
      {"<dict>", Format::xml},
      {"<0g>", Format::xml},
      {"<0f", Format::oldStyle},
      {"{", Format::oldStyle},
      {"", Format::oldStyle},
  };
  for (const auto& c : cases) {
    EXPECT_EQ(readPropertyList(c.contents).format, c.format) << c.contents;
  }
}

}  // namespace
}  // namespace qz::toolkit
