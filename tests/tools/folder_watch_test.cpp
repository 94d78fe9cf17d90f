// SPDX-License-Identifier: MIT
// Waiting for changes of the files in a folder.

#include "tools/support/folder_watch.hpp"

#include <gtest/gtest.h>

#include <filesystem>

#include "tests/tools/play_files.hpp"

namespace qz::tools {
namespace {

TEST(FolderWatch, SeesFilesThatAreMadeWrittenAndRemoved) {
  const play::WorkingDirectory folder;
  folder.write("a.txt", "one");
  int calls = 0;
  watchFolder(folder.path(), "out.txt", [&] {
    folder.write("out.txt", std::string(static_cast<std::size_t>(++calls), 'x'));
    if (calls == 1) folder.write("b.txt", "new");
    if (calls == 2) folder.write("a.txt", "longer");
    if (calls == 3) std::filesystem::remove("b.txt");
    return calls < 4;
  });
  EXPECT_EQ(calls, 4);
}

}  // namespace
}  // namespace qz::tools
