// SPDX-License-Identifier: MIT
// A program with the engine of both languages, which have the same name.

#import "QZ_Plist_State_Parser.h"
#import "checks.h"
#include "qz/engine.hpp"
#include "qz/toolkit/memory/memory_toolkit.hpp"

bool runsTheCppEngine();  // in a file without Objective-C

static void bothEnginesRun() {
  QZ_Plist_State_Parser* const engine = [[QZ_Plist_State_Parser alloc] initWithWindow:nil];
  qz::toolkit::memory::MemoryToolkit toolkit;
  const auto other = qz::QZ_Plist_State_Parser::initWithWindow(toolkit, nullptr);
  CHECK([engine doSimpleCommand:@"IDLE_LOOP" withParams:nil usingObject:nil]);
  CHECK(other->doSimpleCommand("IDLE_LOOP", nullptr, nullptr));
  CHECK(runsTheCppEngine());
  other->terminateParser();
  [engine terminateParser];
  [engine release];
}

int main() {
  NSAutoreleasePool* const pool = [[NSAutoreleasePool alloc] init];
  [[NSApplication sharedApplication] finishLaunching];
  runTest("bothEnginesRun", bothEnginesRun);
  [pool release];
  return testResult();
}
