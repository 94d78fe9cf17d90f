// SPDX-License-Identifier: MIT
// The places of commands that raise: known only for the lists of the script.
#include <gtest/gtest.h>

#include <memory>
#include <sstream>
#include <string>

#include "drivers/memory/memory_driver.hpp"
#include "play_files.hpp"
#include "qz/property_list/scalars.hpp"
#include "tools/play/raised_places.hpp"

namespace qz::tools::play {
namespace {

TEST(PlayRaisedPlaces, AreThoseOfTheScriptsListsAndOfNoOthers) {
  const WorkingDirectory directory;
  directory.write("script.plist", "{ 1 = (IDLE_LOOP,\n (FLASH_ID)); }");
  const InputFile file("script.plist", "a script");
  drivers::MemoryDriver driver;
  const auto engine = QZ_Plist_State_Parser::initWithWindow(driver.toolkit(), {});
  engine->setPlistDictionary(file.dictionary());
  std::ostringstream log;
  engine->setObserver(std::make_shared<RaisedPlaces>(file, *engine, log));

  const auto id = toolkit::Number::withLong(1);
  const auto list = toolkit::asArray(file.dictionary()->objectForKey("1"));
  engine->processCommandArray(list, id);
  EXPECT_EQ(log.str(), "  script.plist:2:2: list 1, command 2: FLASH_ID\n");

  log.str("");
  const auto elements = list->elements();
  engine->processCommandArray(toolkit::Array::make({elements.begin(), elements.end()}), id);
  EXPECT_EQ(log.str(), "") << "the host's own list of the same commands";
}

}  // namespace
}  // namespace qz::tools::play
