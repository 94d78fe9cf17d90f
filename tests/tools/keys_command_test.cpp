// SPDX-License-Identifier: MIT
// The command `keys`.
#include <gtest/gtest.h>

#include <string>

#include "play_files.hpp"
#include "tool_run.hpp"
#include "tools/commands.hpp"

namespace qz::tools {
namespace {

TEST(KeysCommand, PrintsTagsInTheirOrderAndThenAllOthers) {
  const play::WorkingDirectory directory;
  directory.write("script.plist",
                  "{ 12 = (); b = (); 9 = (); 010 = (); \"a\\nc\" = (); \"-3\" = (); }");
  const Result result = run(keysCommand, {"keys", "script.plist"});
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.err, "");
  EXPECT_EQ(result.out, "-3\n9\n010\n12\na\\nc\nb\n");
}

TEST(KeysCommand, RefusesWhatIsNotAScript) {
  const play::WorkingDirectory directory;
  directory.write("array.plist", "( 1 )");
  const Result result = run(keysCommand, {"keys", "array.plist"});
  EXPECT_EQ(result.status, 2);
  EXPECT_EQ(result.out, "");
  EXPECT_EQ(
      result.err,
      "qz-walkthrough: array.plist:1:1: expected a script (a dictionary), found an array of 1\n");
}

}  // namespace
}  // namespace qz::tools
