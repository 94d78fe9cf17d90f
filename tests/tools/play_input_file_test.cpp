// SPDX-License-Identifier: MIT
// Property lists that the player reads: what it says about those that it refuses.
#include <gtest/gtest.h>

#include <string>
#include <string_view>

#include "play_files.hpp"
#include "qz/property_list/scalars.hpp"
#include "tools/support/input_file.hpp"

namespace qz::tools::play {
namespace {

TEST(PlayInputFile, WordsForValuesOfEveryKind) {
  using namespace toolkit;
  const struct {
    ValueRef<> value;
    const char* words;
  } cases[] = {
      {ValueRef<>(), "nothing"},
      {String::make("a"), "the string “a”"},
      {Number::withBool(true), "YES"},
      {Number::withBool(false), "NO"},
      {Number::withLong(1), "the number 1"},
      {Number::withDouble(2.5), "the number 2.5"},
      {Date::make(0), "a date"},
      {Data::make("x"), "data"},
      {Null::make(), "a null"},
      {Uid::make(1), "a UID"},
      {Set::make({}), "a set"},
      {Array::make(), "an empty array"},
      {Array::make({Null::make(), Null::make()}), "an array of 2"},
      {Dictionary::make(), "an empty dictionary"},
      {Dictionary::make({{String::make("a"), Null::make()}}), "a dictionary"},
  };
  for (const auto& test : cases) EXPECT_EQ(foundWords(test.value), test.words);
}

/// Returns the message with which a file of these contents is refused, or "accepted".
std::string refusalOfContents(std::string_view contents) {
  const WorkingDirectory directory;
  directory.write("script.plist", contents);
  try {
    const InputFile file("script.plist", "a script");
  } catch (const Failure& failure) {
    EXPECT_EQ(failure.status(), ExitStatus::badInput);
    return failure.what();
  }
  return "accepted";
}

TEST(PlayInputFile, NamesThePlaceOfTheFaultInTextAndInBytes) {
  EXPECT_EQ(refusalOfContents("{ 1 =\n  (; }"),
            "script.plist:2:4: expected ',' or ')', found ';' (read as old-style property list)");
  EXPECT_EQ(
      refusalOfContents("bplist00\xff"),
      "script.plist: byte 9: the file is too short for a header, an object and a trailer (read "
      "as binary property list)");
}

}  // namespace
}  // namespace qz::tools::play
