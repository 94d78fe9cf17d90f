// SPDX-License-Identifier: MIT
// Pages of the command `storyboard`, and what the tests look for in them.
#pragma once

#include <gtest/gtest.h>

#include <regex>
#include <set>
#include <string>
#include <vector>

#include "tests/tools/tool_run.hpp"
#include "tools/commands.hpp"
#include "tools/support/whole_file.hpp"

namespace qz::tools::storyboard {

inline const std::string repository = QZ_SOURCE_DIR;
inline const std::string backup = repository + "/examples/first-steps/backup.yaml";

/// A page, and what the command says.
struct MadePage {
  std::string html;
  std::string said;
};

/// Runs the command in the working directory, with a toolkit that draws the pictures.
inline MadePage madeOn(const std::string& toolkit, const std::vector<std::string>& arguments) {
  std::vector<std::string> line = {"storyboard", "-o", "page.html", "--toolkit", toolkit};
  line.insert(line.end(), arguments.begin(), arguments.end());
  const Result result = run(storyboardCommand, line);
  EXPECT_EQ(result.err, "");
  EXPECT_EQ(result.status, 0);
  return {wholeFile("page.html").value_or(""), result.out};
}

/// Returns the page with texts instead of pictures.
inline std::string pageOf(const std::vector<std::string>& arguments) {
  return madeOn("memory", arguments).html;
}

/// Returns the first group of each match.
inline std::multiset<std::string> all(const std::string& text, const std::string& pattern) {
  const std::regex regex(pattern);
  std::multiset<std::string> found;
  for (std::sregex_iterator each(text.begin(), text.end(), regex); each != std::sregex_iterator();
       ++each) {
    found.insert((*each)[1]);
  }
  return found;
}

}  // namespace qz::tools::storyboard
