// SPDX-License-Identifier: MIT
// Loading scripts: without a name, with keys that are not strings, and which parts can be changed.

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <memory>
#include <optional>
#include <random>
#include <string>

#include "drivers/memory/memory_driver.hpp"
#include "qz/engine.hpp"

namespace qz {

namespace {

using Engine = QZ_Plist_State_Parser;
namespace fs = std::filesystem;

class ScriptLoading : public testing::Test {
 protected:
  ScriptLoading() {
    const auto number = std::to_string(std::random_device()());
    resources = fs::temp_directory_path() / ("qz-script-loading-" + number);
    fs::create_directories(resources);
    driver.setResourcePath(resources.string());
  }
  ~ScriptLoading() override {
    engine->terminateParser();
    fs::remove_all(resources);
  }

  void write(const std::string& name, const std::string& contents) const {
    std::ofstream(resources / name, std::ios::binary) << contents;
  }
  bool load(const std::optional<std::string>& name, const std::optional<std::string>& key) {
    return engine->loadPlist(name, key, nullptr, false);
  }

  fs::path resources;
  drivers::MemoryDriver driver;
  std::shared_ptr<Engine> engine = Engine::initWithWindow(driver.toolkit(), nullptr);
};

// An absent name is formatted as "(null)".
TEST_F(ScriptLoading, NoNameIsTheNameOfNothing) {
  EXPECT_FALSE(load(std::nullopt, "1"));
  EXPECT_EQ(engine->plistDictionary()->count(), 0U);
  write("(null).plist", "{ 1 = ( IDLE_LOOP ); }");
  EXPECT_FALSE(load(std::nullopt, "1"));
  write("(null)", "{ 1 = ( IDLE_LOOP ); }");
  EXPECT_TRUE(load(std::nullopt, "1"));
}

TEST_F(ScriptLoading, AnAbsoluteNameIsNotLookedForInTheResources) {
  write("intro.plist", "{ 1 = ( IDLE_LOOP ); }");
  driver.setResourcePath((resources / "elsewhere").generic_string());
  EXPECT_FALSE(load("intro.plist", "1"));
  EXPECT_TRUE(load((resources / "intro.plist").generic_string(), "1"));
}

TEST_F(ScriptLoading, ANameThatIsNotUtf8IsMissing) {
  EXPECT_FALSE(load("\xFF.plist", "1"));
  EXPECT_FALSE(load((resources / "intro").generic_string() + "\xFF", "1"));
}

TEST_F(ScriptLoading, AScriptCanBeChangedItsListsCannot) {
  write("intro.plist", "{ 1 = ( IDLE_LOOP ); }");
  ASSERT_TRUE(load("intro.plist", "1"));
  const auto script = engine->plistDictionary();
  const auto list = toolkit::asArray(script->objectForKey("1"));
  EXPECT_THROW(list->addObject(toolkit::String::make("IDLE_LOOP")), toolkit::Exception);
  script->setObject(list, "2");
  EXPECT_TRUE(load("missing", "2"));
}

TEST_F(ScriptLoading, EveryLoadMakesAScriptOfItsOwn) {
  write("intro.plist", "{ 1 = ( IDLE_LOOP ); }");
  ASSERT_TRUE(load("intro.plist", "1"));
  const auto first = engine->plistDictionary();
  ASSERT_TRUE(load("intro.plist", "1"));
  EXPECT_FALSE(engine->plistDictionary() == first);
  EXPECT_EQ(first->count(), 0U);
}

/// Returns a binary property list: a dictionary with one entry, whose value is a list of the idle
/// command. `key` is the encoded object of the key.
std::string binaryScript(const std::string& key) {
  std::string bytes("bplist00");
  std::string offsets;
  for (const std::string& object :
       {std::string("\xD1\x01\x02"), key, std::string("\xA1\x03"), std::string("\x59IDLE_LOOP")}) {
    offsets += static_cast<char>(bytes.size());
    bytes += object;
  }
  const auto table = static_cast<char>(bytes.size());
  bytes += offsets + std::string(6, '\0') + "\x01\x01";
  bytes += std::string(7, '\0') + '\x04';  // the count of objects
  bytes += std::string(8, '\0');           // the index of the root
  return bytes + std::string(7, '\0') + table;
}

TEST_F(ScriptLoading, AKeyThatIsANumberCountsForTheSmallestButIsNoKeyOfAList) {
  write("intro.plist", binaryScript(std::string("\x10\x05")));
  EXPECT_FALSE(load("intro.plist", ""));
  EXPECT_EQ(engine->currentCommandState(), "5");
  EXPECT_EQ(engine->plistDictionary()->count(), 1U);
}

TEST_F(ScriptLoading, ANumberBeyond32BitsCountsForTheSmallestByItsLowBits) {
  using Entry = toolkit::Dictionary::Entry;
  const auto list = toolkit::Array::make({toolkit::String::make("IDLE_LOOP")});
  const Entry two{toolkit::Number::withLong(4'294'967'298), list};
  const Entry three{toolkit::String::make("3"), list};
  for (const auto& entries : {std::vector{two, three}, std::vector{three, two}}) {
    engine->setPlistDictionary(toolkit::Dictionary::make(entries));
    EXPECT_FALSE(load("missing", ""));
    EXPECT_EQ(engine->currentCommandState(), "2");
  }
}

TEST_F(ScriptLoading, AKeyWithoutANumberRaisesWhenTheSmallestIsSought) {
  write("intro.plist", binaryScript(std::string("\x41\x05")));  // one byte of data
  EXPECT_TRUE(load("intro.plist", std::nullopt));
  EXPECT_THROW(load("intro.plist", ""), toolkit::Exception);
  EXPECT_FALSE(engine->lastTagId());
}

TEST_F(ScriptLoading, AMillionElementsAreReadAndRun) {
  std::string script = "{ 1 = ( ";
  for (int i = 0; i < 1'000'000; ++i) script += "X,";
  write("intro.plist", script + "IDLE_LOOP ); }");
  EXPECT_TRUE(load("intro.plist", "1"));
  EXPECT_EQ(engine->plistDictionary()->objectForKey("1")->count(), 1'000'001U);
}

}  // namespace

}  // namespace qz
