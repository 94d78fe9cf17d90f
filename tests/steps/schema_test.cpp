// SPDX-License-Identifier: MIT
// The schema and the compiler refuse the same mistakes of form: scripts/check-schema shows these to
// the schema.

#include <gtest/gtest.h>

#include <fstream>

#include "tests/steps/source_folder.hpp"

namespace qz::tools::steps {
namespace {

bool isRefused(const std::string& path) {
  try {
    readSource(path);
  } catch (const SourceRefused&) {
    return true;
  }
  return false;
}

TEST(Schema, TheCompilerRefusesItsMistakesToo) {
  const SourceFolder folder;
  folder.write("h", "({ class = NSButton; tag = 1; frame = (0, 0, 90, 30); title = A; })");
  std::ifstream mistakes(std::string(QZ_SOURCE_DIR) + "/tests/steps/schema/mistakes.yaml");
  int count = 0;
  for (std::string line; std::getline(mistakes, line);) {
    const std::size_t start = line.find(": {");
    if (line.starts_with('#') || start == std::string::npos) continue;
    ++count;
    folder.write("mistake.yaml", line.substr(start + 2) + "\n");
    EXPECT_TRUE(isRefused("mistake.yaml")) << line;
  }
  EXPECT_GT(count, 30);
}

}  // namespace
}  // namespace qz::tools::steps
