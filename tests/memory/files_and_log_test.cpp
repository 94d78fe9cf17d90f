// SPDX-License-Identifier: MIT
// Files and the log.

#include <sys/stat.h>

#include <string>
#include <vector>

#include "tests/memory/support.hpp"

namespace qz::toolkit::memory::test {
namespace {

class FilesTest : public MemoryTest {
 protected:
  const Files& files = toolkit.files();
  Directory directory;
};

TEST_F(FilesTest, TheResourcePathIsAbsoluteAndHasNoSlashAtItsEnd) {
  namespace fs = std::filesystem;
  EXPECT_EQ(files.resourcePath(), fs::current_path().generic_string());
  const struct {
    std::string set, resulting;
  } cases[] = {
      {directory.path(), directory.path()},
      {directory.path() + "/", directory.path()},
      {directory.path() + "///", directory.path()},
      {"somewhere", (fs::current_path() / "somewhere").generic_string()},
      {"", fs::current_path().generic_string()},
      {"/", fs::current_path().root_name().generic_string()},
  };
  for (const auto& c : cases) {
    driver.setResourcePath(c.set);
    EXPECT_EQ(files.resourcePath(), c.resulting) << c.set;
  }
}

TEST_F(FilesTest, WhatExistsAndWhatCanBeRead) {
  directory.write("file", "contents");
  directory.write("empty", "");
  directory.write("folder/inside", "x");
  const struct {
    std::string path;
    bool exists;
    std::optional<std::string> contents;
  } cases[] = {
      {directory.path("file"), true, "contents"},
      {directory.path("empty"), true, ""},
      {directory.path("folder"), true, std::nullopt},
      {directory.path("folder/inside"), true, "x"},
      {directory.path("missing"), false, std::nullopt},
      {directory.path("file/below"), false, std::nullopt},
      {directory.path("not UTF-8: \xFF"), false, std::nullopt},
      {directory.path("file") + std::string("\0x", 2), false, std::nullopt},
      {std::string(100'000, 'x'), false, std::nullopt},
      {"", false, std::nullopt},
  };
  for (const auto& c : cases) {
    EXPECT_EQ(files.fileExistsAtPath(c.path), c.exists) << c.path.substr(0, 200);
    EXPECT_EQ(files.contentsAtPath(c.path), c.contents) << c.path.substr(0, 200);
  }
}

#if !defined(_WIN32)
TEST_F(FilesTest, LinksAreFollowedAndPipesAreNotRead) {
  directory.write("file", "contents");
  ASSERT_EQ(::mkfifo(directory.path("pipe").c_str(), 0600), 0);
  std::filesystem::create_symlink("file", directory.path("link"));
  std::filesystem::create_symlink("nowhere", directory.path("broken"));
  EXPECT_EQ(files.contentsAtPath(directory.path("link")), "contents");
  EXPECT_TRUE(files.fileExistsAtPath(directory.path("pipe")));
  EXPECT_EQ(files.contentsAtPath(directory.path("pipe")), std::nullopt);
  EXPECT_FALSE(files.fileExistsAtPath(directory.path("broken")));
  EXPECT_EQ(files.contentsAtPath(directory.path("broken")), std::nullopt);
}
#endif

TEST_F(FilesTest, AllBytesAreRead) {
  std::string bytes;
  for (int i = 0; i < 300'000; ++i) bytes += static_cast<char>(i * 7);
  directory.write("bytes", bytes);
  EXPECT_TRUE(files.contentsAtPath(directory.path("bytes")) == bytes);
}

TEST_F(FilesTest, NamesAreUtf8) {
  directory.write("\xC3\xBC\xE2\x82\xAC.plist", "x");
  EXPECT_EQ(files.contentsAtPath(directory.path("\xC3\xBC\xE2\x82\xAC.plist")), "x");
  driver.setResourcePath(directory.path("\xC3\xBC"));
  EXPECT_EQ(files.resourcePath(), directory.path("\xC3\xBC"));
}

TEST(ToolkitsLog, WithoutASinkGoesToStandardError) {
  MemoryToolkit toolkit;
  testing::internal::CaptureStderr();
  toolkit.log().write("one");
  toolkit.log().write("");
  toolkit.log().write("t\xC3\xBC");
  EXPECT_EQ(testing::internal::GetCapturedStderr(), "one\n\nt\xC3\xBC\n");
}

TEST(ToolkitsLog, WithASinkGoesNowhereElse) {
  MemoryToolkit toolkit;
  std::string lines;
  testing::internal::CaptureStderr();
  toolkit.log().setSink([&](std::string_view line) { lines += line; });
  toolkit.log().write("one");
  EXPECT_EQ(testing::internal::GetCapturedStderr(), "");
  EXPECT_EQ(lines, "one");
  testing::internal::CaptureStderr();
  toolkit.log().setSink(nullptr);
  toolkit.log().write("two");
  EXPECT_EQ(testing::internal::GetCapturedStderr(), "two\n");
}

using LogTest = MemoryTest;

TEST_F(LogTest, ADriverWithoutASinkIsSilent) {
  testing::internal::CaptureStderr();
  toolkit.log().write("at first");
  driver.setLogSink([](std::string_view) {});
  driver.setLogSink(nullptr);
  toolkit.log().write("again");
  EXPECT_EQ(testing::internal::GetCapturedStderr(), "");
}

TEST_F(LogTest, EveryLineGoesToTheSink) {
  std::vector<std::string> lines;
  toolkit.log().write("before there is a sink");
  driver.setLogSink([&](std::string_view line) { lines.emplace_back(line); });
  toolkit.log().write("one");
  toolkit.log().write("");
  driver.setLogSink(nullptr);
  toolkit.log().write("two");
  EXPECT_EQ(lines, (std::vector<std::string>{"one", ""}));
}

TEST_F(LogTest, ASinkMayReplaceItself) {
  std::vector<std::string> lines;
  const std::string name = "first: ";
  driver.setLogSink([this, &lines, name](std::string_view line) {
    driver.setLogSink(nullptr);
    lines.push_back(name + std::string(line));
  });
  toolkit.log().write("one");
  toolkit.log().write("two");
  EXPECT_EQ(lines, std::vector<std::string>{"first: one"});
}

}  // namespace
}  // namespace qz::toolkit::memory::test
