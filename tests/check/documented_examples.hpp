// SPDX-License-Identifier: MIT
// The examples of the page on checking.
#pragma once

#include <gtest/gtest.h>

#include <algorithm>
#include <map>
#include <set>
#include <sstream>
#include <string>
#include <vector>

#include "tests/check/checking.hpp"
#include "tests/tools/play_files.hpp"
#include "tools/support/whole_file.hpp"

namespace qz::tools::check {

/// The entry of one code in the page.
struct Example {
  std::string code;
  std::set<std::string> codes;  ///< with those that cannot be avoided
  std::string severity{};
  std::string script{};
  std::string mended{};
  std::string window{};
  std::map<std::string, std::string> files{};  ///< beside the script, by name
};

inline std::string afterWord(const std::string& line, const std::string& word) {
  return line.starts_with(word) ? line.substr(word.size()) : "";
}

/// Returns the text that holds a block, from the words behind its fence.
inline std::string* blockOf(Example& example, const std::string& fence) {
  if (fence == "plist") return &example.script;
  if (fence == "plist mended") return &example.mended;
  if (fence == "plist window") return &example.window;
  const std::string file = afterWord(fence, "text ");
  return file.empty() ? nullptr : &example.files[file];
}

inline std::vector<Example> documentedExamples() {
  std::istringstream page(*wholeFile(std::string(QZ_SOURCE_DIR) + "/docs/checking.md"));
  std::vector<Example> found;
  std::string* block = nullptr;
  bool isInBlock = false;
  for (std::string line; std::getline(page, line);) {
    if (line.starts_with("```")) {
      isInBlock = !isInBlock;
      block = isInBlock && !found.empty() ? blockOf(found.back(), line.substr(3)) : nullptr;
    } else if (isInBlock) {
      if (block) *block += line + '\n';
    } else if (const auto heading = afterWord(line, "### `"); !heading.empty()) {
      const std::string code = heading.substr(0, heading.find('`'));
      found.push_back({.code = code, .codes = {code}});
    } else if (const auto severity = afterWord(line, "Severity: "); !severity.empty()) {
      found.back().severity = severity.substr(0, severity.find_first_of(".,;"));
    } else if (const auto with = afterWord(line, "Comes with: [`"); !with.empty()) {
      found.back().codes.insert(with.substr(0, with.find('`')));
    }
  }
  return found;
}

/// Writes the files of an example, with this script.
inline void writeExample(const play::WorkingDirectory& directory, const Example& example,
                         const std::string& script) {
  directory.write("script.plist", script);
  if (!example.window.empty()) directory.write("window.plist", example.window);
  for (const auto& [name, text] : example.files) directory.write(name, text);
}

/// Returns the name of a test about an example.
inline std::string testNameOf(const testing::TestParamInfo<Example>& each) {
  std::string name = each.param.code;
  std::replace(name.begin(), name.end(), '-', '_');
  return name;
}

}  // namespace qz::tools::check
