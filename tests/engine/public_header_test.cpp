// SPDX-License-Identifier: MIT
// The names that the public header brings into the global namespace.
#include <gtest/gtest.h>

#include <type_traits>

#include "QZ_Plist_State_Parser.hpp"

namespace host {
namespace {

TEST(PublicHeader, BringsTheEngineIntoTheGlobalNamespace) {
  EXPECT_TRUE((std::is_same_v<::QZ_Plist_State_Parser, qz::QZ_Plist_State_Parser>));
}

TEST(PublicHeader, BringsTheNamesOfCommandsIntoTheGlobalNamespace) {
  EXPECT_EQ(&::QZ_PLIST_STATE_PARSER_TERMINATE_PARSER, &qz::QZ_PLIST_STATE_PARSER_TERMINATE_PARSER);
  EXPECT_EQ(&QZ_PLIST_STATE_PARSER_FLASH_ID, &qz::QZ_PLIST_STATE_PARSER_FLASH_ID);
  EXPECT_EQ(::QZ_PLIST_STATE_PARSER_RETURN_TO_IDLE_LOOP, "IDLE_LOOP");
}

}  // namespace
}  // namespace host
