// SPDX-License-Identifier: MIT
// The part of the program in both languages that knows only the C++ header.

#include "QZ_Plist_State_Parser.hpp"
#include "qz/toolkit/memory/memory_toolkit.hpp"

bool runsTheCppEngine();

bool runsTheCppEngine() {
  qz::toolkit::memory::MemoryToolkit toolkit;
  const auto engine = QZ_Plist_State_Parser::initWithWindow(toolkit, nullptr);
  engine->terminateParser();
  return engine->terminating() && !QZ_PLIST_STATE_PARSER_FLASH_ID.empty();
}
