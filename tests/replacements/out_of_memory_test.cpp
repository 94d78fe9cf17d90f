// SPDX-License-Identifier: MIT
// An engine that runs out of memory: std::bad_alloc reaches the host, nothing leaks, and the engine
// still works afterwards.

#include <gtest/gtest.h>

#include <memory>
#include <new>
#include <optional>
#include <string>

#include "drivers/memory/memory_driver.hpp"
#include "qz/engine.hpp"
#include "tests/failing_allocations.hpp"

namespace qz {

namespace {

using namespace failing_allocations;
using Engine = QZ_Plist_State_Parser;

class OutOfMemory : public testing::Test {
 protected:
  drivers::MemoryDriver driver;
  toolkit::Ref<toolkit::Window> window = driver.makeWindow({0, 0, 300, 200});
  toolkit::Ref<toolkit::View> label =
      driver.makeView(drivers::ViewKind::textField, 5, {0, 0, 9, 9}, window->contentView());
  std::shared_ptr<Engine> engine = Engine::init(driver.toolkit());
};

TEST_F(OutOfMemory, LoadingAScriptEndsAndCanBeTriedAgain) {
  engine->getGuiAssetsFromWindow(window);
  driver.setResourcePath(QZ_TEST_DATA);
  const std::optional<std::string> scripts[] = {"mixed-script.plist", "mixed-script-binary.plist"};
  for (const auto& script : scripts) {
    bool loaded = false;
    const int failures = failuresOf([&] {
      loaded = false;
      engine->setPlistDictionary(nullptr);
      try {
        loaded = engine->loadPlist(script, std::nullopt, nullptr, false);
      } catch (...) {
        engine->setPlistDictionary(nullptr);  // else a script left behind counts as leaked
        throw;
      }
      engine->setPlistDictionary(nullptr);
    });
    // NOLINTNEXTLINE(clang-analyzer-unix.Malloc): delete frees what operator new above allocates
    EXPECT_GT(failures, 5) << *script;
    EXPECT_TRUE(loaded) << *script;
    EXPECT_TRUE(engine->loadPlist(script, "1", nullptr, false)) << *script;
    EXPECT_EQ(driver.look(label).text.string(), "a & b") << *script;
  }
}

TEST_F(OutOfMemory, BuildingAnEntryEndsAndLeavesTheDescriptionAsItWas) {
  const std::optional<std::string> name = "NSButton";
  Engine::Dictionary entries = toolkit::Dictionary::make();
  allocationsLeft = 0;
  EXPECT_THROW(engine->createNextGuiAssetEntry(&entries, name, {1, 2, 3, 4}, 12), std::bad_alloc);
  allocationsLeft = never;
  EXPECT_EQ(entries->count(), 0U);
}

}  // namespace

}  // namespace qz
