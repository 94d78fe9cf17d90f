// SPDX-License-Identifier: MIT
#include "engine/endless_chains.hpp"

#include <gtest/gtest.h>

#include "qz/property_list/scalars.hpp"
#include "qz/toolkit/tag.hpp"

namespace qz {

namespace {

using toolkit::Array;
using toolkit::Dictionary;
using toolkit::Number;
using toolkit::String;
using toolkit::ValueRef;

ValueRef<> chain(toolkit::Tag tag) {
  return Array::make({String::make("Process_Commands_For_Id"), Number::withLong(tag)});
}

// Returns a script of lists that only chain: each key's list runs its tags in order.
ValueRef<Dictionary> script(
    const std::vector<std::pair<std::string, std::vector<toolkit::Tag>>>& lists) {
  auto script = Dictionary::make();
  for (const auto& [key, tags] : lists) {
    const auto list = Array::make();
    for (const toolkit::Tag tag : tags) list->addObject(chain(tag));
    script->setObject(list, key);
  }
  return script;
}

TEST(EndlessChains, AreTheLoopsARunEndsUpIn) {
  const struct {
    const char* what;
    std::vector<std::pair<std::string, std::vector<toolkit::Tag>>> lists;
    std::vector<std::string> loops;
  } cases[] = {
      {"no chains", {{"1", {}}, {"2", {}}}, {}},
      {"chains that end", {{"1", {2, 3}}, {"2", {3}}, {"3", {}}}, {}},
      {"a chain to no list", {{"1", {9}}}, {}},
      {"a list that runs itself", {{"1", {1}}}, {"1 -> 1"}},
      {"two that run each other", {{"3", {7}}, {"7", {3}}}, {"3 -> 7 -> 3"}},
      {"the way to a loop is no part of it", {{"1", {2}}, {"2", {3}}, {"3", {2}}}, {"2 -> 3 -> 2"}},
      {"a list that ends is passed by", {{"1", {5, 2}}, {"2", {1}}, {"5", {}}}, {"1 -> 2 -> 1"}},
      {"the first that never ends is where a run stays",
       {{"1", {1, 2}}, {"2", {2}}},
       {"1 -> 1", "2 -> 2"}},
      {"a key that no tag spells", {{"007", {7}}}, {}},
  };
  for (const auto& c : cases) EXPECT_EQ(endlessChains(script(c.lists)).loops, c.loops) << c.what;
}

TEST(EndlessChains, ASimpleCommandChainsToItsOwnList) {
  const auto list = Array::make({String::make("PROCESS_COMMANDS_FOR_ID")});
  const auto script = Dictionary::make();
  script->setObject(list, "4");
  EXPECT_EQ(endlessChains(script).loops, std::vector<std::string>{"4 -> 4"});
}

TEST(EndlessChains, EndWithTheWalkThrough) {
  const auto script = Dictionary::make();
  script->setObject(Array::make({String::make("TERMINATE_PARSER"), chain(4)}), "4");
  EXPECT_TRUE(endlessChains(script).loops.empty());
  script->setObject(Array::make({chain(5), String::make("TERMINATE_PARSER")}), "5");
  EXPECT_EQ(endlessChains(script).loops, std::vector<std::string>{"5 -> 5"});
}

TEST(EndlessChains, EndWithAListThatEndsTheWalkThrough) {
  const auto script = Dictionary::make();
  script->setObject(Array::make({chain(2), chain(3)}), "1");
  script->setObject(Array::make({String::make("TERMINATE_PARSER")}), "2");
  script->setObject(Array::make({chain(3)}), "3");
  const auto chains = endlessChains(script);
  EXPECT_EQ(chains.loops, std::vector<std::string>{"3 -> 3"});
  EXPECT_FALSE(chains.loopOf.contains("1")) << "list 2 ends the walk-through before list 3 runs";
  EXPECT_TRUE(chains.loopOf.contains("3"));
}

TEST(EndlessChains, EndWithAListThatRunsAListThatEndsTheWalkThrough) {
  const auto script = Dictionary::make();
  script->setObject(Array::make({chain(4), chain(1)}), "1");
  script->setObject(Array::make({String::make("TERMINATE_PARSER")}), "2");
  script->setObject(Array::make({chain(2), chain(4)}), "4");
  EXPECT_TRUE(endlessChains(script).loops.empty());
}

TEST(EndlessChains, BeforeAListThatEndsTheWalkThroughCount) {
  const auto script = Dictionary::make();
  script->setObject(Array::make({chain(1), chain(2)}), "1");
  script->setObject(Array::make({String::make("TERMINATE_PARSER")}), "2");
  EXPECT_EQ(endlessChains(script).loops, std::vector<std::string>{"1 -> 1"});
}

TEST(EndlessChains, ASimpleCommandOfAnOddKeyChainsToItsNumber) {
  const auto list = Array::make({String::make("PROCESS_COMMANDS_FOR_ID")});
  const auto script = Dictionary::make();
  script->setObject(list, "07");
  EXPECT_TRUE(endlessChains(script).loops.empty());
  script->setObject(list, "7");
  const auto chains = endlessChains(script);
  EXPECT_EQ(chains.loops, std::vector<std::string>{"7 -> 7"});
  EXPECT_TRUE(chains.loopOf.contains("07"));
}

TEST(EndlessChains, SayForEveryListWhereItEndsUp) {
  const auto chains = endlessChains(script({{"1", {2}}, {"2", {2}}, {"3", {1}}, {"4", {}}}));
  ASSERT_EQ(chains.loops, std::vector<std::string>{"2 -> 2"});
  EXPECT_EQ(chains.loopOf.size(), 3U);
  EXPECT_FALSE(chains.loopOf.contains("4"));
}

TEST(EndlessChains, WhatIsNoListChainsToNothing) {
  const auto script = Dictionary::make();
  script->setObject(String::make("text"), "1");
  script->setObject(
      Array::make({Array::make(), Array::make({Number::withLong(1), chain(1)}),
                   Array::make({String::make("PROCESS_COMMANDS_FOR_ID"), Array::make()})}),
      "2");
  EXPECT_TRUE(endlessChains(script).loops.empty());
}

TEST(EndlessChains, OfAHundredThousandListsAreFoundAtOnce) {
  const auto script = Dictionary::make();
  std::vector<Dictionary::Entry> entries;
  constexpr toolkit::Tag count = 100'000;
  for (toolkit::Tag i = 0; i < count; ++i) {
    entries.push_back({String::make(std::to_string(i)), Array::make({chain((i + 1) % count)})});
  }
  const auto chains = endlessChains(Dictionary::make(std::move(entries)));
  EXPECT_EQ(chains.loops.size(), 1U);
  EXPECT_EQ(chains.loopOf.size(), static_cast<std::size_t>(count));
}

}  // namespace

}  // namespace qz
