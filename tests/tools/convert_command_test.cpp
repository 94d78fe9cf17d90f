// SPDX-License-Identifier: MIT
// The command `convert`: the format it writes, and that a failure damages no file.
#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <vector>

#include "play_files.hpp"
#include "qz/property_list/binary_writer.hpp"
#include "qz/property_list/canonical_dump.hpp"
#include "qz/property_list/collections.hpp"
#include "qz/property_list/reader.hpp"
#include "qz/property_list/scalars.hpp"
#include "tool_run.hpp"
#include "tools/commands.hpp"
#include "tools/output_format.hpp"
#include "tools/support/suggestions.hpp"

namespace qz::tools {
namespace {

namespace fs = std::filesystem;

std::string contentsOf(const std::string& path) {
  std::ifstream file(path, std::ios::binary);
  return {std::istreambuf_iterator<char>(file), {}};
}

std::vector<std::string> writableNames() {
  std::vector<std::string> names;
  for (const toolkit::FormatRow& row : writableFormats()) names.emplace_back(row.name);
  return names;
}

class ConvertCommand : public testing::Test {
 protected:
  void SetUp() override { directory_.write("in.plist", "{ k = (a, <01>); }"); }

  Result convert(std::vector<std::string> arguments) const {
    arguments.insert(arguments.begin(), "convert");
    return run(convertCommand, arguments);
  }
  /// Writes a binary file with a value that XML cannot express.
  void writeUnwritable() const {
    const auto value = toolkit::Dictionary::make(
        {{toolkit::String::make("k"), toolkit::Array::make({toolkit::Null::make()})}});
    directory_.write("null.bplist", toolkit::writeBinaryPropertyList(value));
  }
  static std::size_t filesHere() {
    return static_cast<std::size_t>(
        std::distance(fs::directory_iterator("."), fs::directory_iterator()));
  }

  play::WorkingDirectory directory_;
};

TEST_F(ConvertCommand, ChoosesTheFormat) {
  const struct {
    std::vector<std::string> arguments;
    toolkit::Format format;
  } cases[] = {
      {{"in.plist", "out.plist"}, toolkit::Format::xml},
      {{"in.plist", "out.xml"}, toolkit::Format::xml},
      {{"in.plist", "out"}, toolkit::Format::xml},
      {{"in.plist", "out.bplist"}, toolkit::Format::binary},
      {{"in.plist", "out.bin"}, toolkit::Format::binary},
      {{"in.plist", "out.plist", "--format", "binary"}, toolkit::Format::binary},
      {{"in.plist", "out.bplist", "--format=xml"}, toolkit::Format::xml},
  };
  for (const auto& c : cases) {
    const auto result = convert(c.arguments);
    EXPECT_EQ(result.status, 0) << result.err;
    const auto read = toolkit::readPropertyList(contentsOf(c.arguments[1]));
    EXPECT_EQ(read.format, c.format) << c.arguments[1];
    EXPECT_EQ(toolkit::canonicalDump(*read.value),
              "{\"dict\":[[\"k\",[\"a\",{\"data\":\"01\"}]]]}");
  }
  EXPECT_EQ(convert({"in.plist", "out", "--format", "yaml"}).err,
            "qz-walkthrough: --format: expected " + enumerate(writableNames()) +
                ", found “yaml”; see qz-walkthrough convert --help\n");
}

TEST_F(ConvertCommand, ReplacesAFileAndKeepsWhatBelongsToIt) {
  directory_.write("real.bplist", "before");
  fs::permissions("real.bplist", fs::perms::owner_read | fs::perms::owner_write);
  fs::create_symlink("real.bplist", "link.bplist");
  EXPECT_EQ(convert({"in.plist", "link.bplist"}).status, 0);
  EXPECT_TRUE(fs::is_symlink("link.bplist"));
  EXPECT_TRUE(contentsOf("real.bplist").starts_with("bplist00"));
  EXPECT_EQ(fs::status("real.bplist").permissions(),
            fs::perms::owner_read | fs::perms::owner_write);
  EXPECT_EQ(convert({"in.plist", "in.plist"}).status, 0);
  EXPECT_TRUE(contentsOf("in.plist").starts_with("<?xml"));
  EXPECT_EQ(filesHere(), 3U);
}

TEST_F(ConvertCommand, LeavesTheFileWhereTheFormatCannotHoldTheValue) {
  writeUnwritable();
  directory_.write("out.xml", "before");
  const auto result = convert({"null.bplist", "out.xml"});
  EXPECT_EQ(result.status, 1);
  EXPECT_TRUE(
      result.err.starts_with("qz-walkthrough: null.bplist: no XML property list can hold it: "))
      << result.err;
  EXPECT_NE(result.err.find("/k/0"), std::string::npos) << result.err;
  EXPECT_EQ(contentsOf("out.xml"), "before");
  EXPECT_EQ(filesHere(), 3U);
}

TEST_F(ConvertCommand, TellsWhyAFileCannotBeReadOrWritten) {
  fs::create_directory("folder");
  const struct {
    std::vector<std::string> arguments;
    int status;
    const char* line;
  } cases[] = {
      {{"none.plist", "out"}, 2, "none.plist: no such file; expected a property list"},
      {{"in.plist", "folder"}, 1, "folder: cannot be written (Is a directory)"},
      {{"in.plist", "no/out"}, 1, "no/out: cannot be written (No such file or directory)"},
      {{"in.plist", "/dev/full"}, 1, "/dev/full: cannot be written (No space left on device)"},
  };
  for (const auto& c : cases) {
    const auto result = convert(c.arguments);
    EXPECT_EQ(result.err, std::string("qz-walkthrough: ") + c.line + "\n");
    EXPECT_EQ(result.status, c.status);
  }
  EXPECT_EQ(filesHere(), 2U);
}

}  // namespace
}  // namespace qz::tools
