// SPDX-License-Identifier: MIT
// Describes a window in C++, in the form that `loadGuiAssets` reads, and has the engine build it.
#include <iostream>

#include "QZ_Plist_State_Parser.hpp"
#include "qz/drivers/driver.hpp"
#include "qz/drivers/memory/toolkit_row.hpp"

int main() {
  const auto screen = qz::drivers::makeMemoryDriver();
  screen->setLogSink([](std::string_view line) { std::cout << "log: " << line << '\n'; });
  const auto engine = QZ_Plist_State_Parser::initWithWindow(screen->toolkit(), nullptr);

  // The number is the entry's key, and a button's tag. It must be unique across classes: a later
  // entry replaces an earlier one.
  auto entries = qz::toolkit::Dictionary::make();
  engine->createNextGuiAssetEntry(&entries, "NSWindow", {200, 200, 300, 120}, 1000);
  engine->createNextGuiAssetEntry(&entries, "NSTextField", {20, 70, 260, 30}, 1001);
  engine->createNextGuiAssetEntry(&entries, "NSButton", {200, 20, 80, 30}, 2);
  engine->loadGuiAssets(entries, nullptr);

  // Only buttons come with their tag. The host can give tags to the others.
  const auto controls = engine->addedObjectToTutorial()->elements();
  for (const auto& control : controls) {
    if (control->asTextField()) control->setTag(5);
    std::cout << control->className() << " has the tag " << control->tag() << '\n';
  }

  screen->click(engine->findObjectWithTag(2));
  engine->terminateParser();
}
