// SPDX-License-Identifier: MIT
// Waiting for changes of the files in folders.

#include "tools/support/folder_watch.hpp"

#include <gtest/gtest.h>

#include <filesystem>
#include <set>

#include "tests/tools/play_files.hpp"

namespace qz::tools {
namespace {

bool goOn() { return true; }

TEST(FolderWatch, SeesFilesThatAreMadeWrittenAndRemoved) {
  const play::WorkingDirectory folder;
  folder.write("a.txt", "one");
  int calls = 0;
  const std::set<std::string> folders = {folder.path()};
  watchFolders(
      folders, {},
      [&] {
        ++calls;
        if (calls == 1) folder.write("b.txt", "new");
        if (calls == 2) folder.write("a.txt", "longer");
        if (calls == 3) std::filesystem::remove("b.txt");
        return calls < 4 ? folders : std::set<std::string>{};
      },
      goOn);
  EXPECT_EQ(calls, 4);
}

TEST(FolderWatch, SeesOtherFoldersOnceTheyAreNamed) {
  const play::WorkingDirectory folder;
  std::filesystem::create_directories("own");
  std::filesystem::create_directories("other");
  int calls = 0;
  watchFolders(
      {"own"}, {},
      [&]() -> std::set<std::string> {
        // The second call is because nobody has watched the other folder until now.
        if (++calls == 2) folder.write("other/a.txt", "new");
        return calls < 3 ? std::set<std::string>{"own", "other"} : std::set<std::string>{};
      },
      goOn);
  EXPECT_EQ(calls, 3);
}

/// Returns how often the watch calls while first out.txt and then another file are written.
int callsWhileWriting(const std::set<std::string>& outputs) {
  const play::WorkingDirectory folder;
  int calls = 0;
  int rests = 0;
  const auto act = [&] {
    ++calls;
    const bool isOver = std::filesystem::exists("end.txt");
    return isOver ? std::set<std::string>{} : std::set<std::string>{folder.path()};
  };
  watchFolders({folder.path()}, outputs, act, [&] {
    folder.write(++rests == 1 ? "out.txt" : "end.txt", "new");
    return true;
  });
  return calls;
}

TEST(FolderWatch, DoesNotSeeWhatIsWrittenToTheOutputs) {
  EXPECT_EQ(callsWhileWriting({"out.txt"}), 2);  // at first, and for end.txt
  EXPECT_EQ(callsWhileWriting({}), 3);
}

TEST(FolderWatch, EndsWhenTheRestSaysSo) {
  const play::WorkingDirectory folder;
  int calls = 0;
  int rests = 0;
  const auto act = [&] {
    ++calls;
    return std::set<std::string>{folder.path()};
  };
  watchFolders({folder.path()}, {}, act, [&] { return ++rests < 3; });
  EXPECT_EQ(calls, 1);
  EXPECT_EQ(rests, 3);
}

}  // namespace
}  // namespace qz::tools
