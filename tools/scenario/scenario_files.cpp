// SPDX-License-Identifier: MIT
// Finds and reads scenario files.

#include "tools/scenario/scenario_files.hpp"

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <system_error>

#include "tools/scenario/statements.hpp"
#include "tools/support/whole_file.hpp"

namespace qz::tools::scenario {
namespace {

namespace fs = std::filesystem;

std::vector<std::string> scenariosBelow(const std::string& directory, std::string& problem) {
  std::vector<std::string> found;
  std::error_code error;
  for (fs::recursive_directory_iterator entry(directory, error), end; !error && entry != end;
       entry.increment(error)) {
    if (entry->path().extension() == ".walk" && entry->is_regular_file()) {
      found.push_back(entry->path().string());
    }
  }
  std::sort(found.begin(), found.end());
  if (error) problem = directory + ": " + error.message();
  if (!error && found.empty()) problem = directory + ": no .walk file in or below this directory";
  return found;
}

void readFile(const std::string& path, ReadFiles& read) {
  const auto text = wholeFile(path);
  if (!text) {
    read.problems.push_back(path + ": cannot be read (" + std::strerror(errno) + ")");
    return;
  }
  try {
    read.files.push_back({path, parseScenarios(*text, vocabulary())});
  } catch (const SyntaxError& error) {
    read.problems.push_back(path + ":" + std::to_string(error.at().line) + ":" +
                            std::to_string(error.at().column) + ": " + error.what());
  }
}

}  // namespace

ReadFiles readScenarios(const std::vector<std::string>& paths) {
  ReadFiles read;
  std::vector<std::string> files;
  for (const auto& path : paths) {
    std::string problem;
    auto found = fs::is_directory(path) ? scenariosBelow(path, problem) : std::vector{path};
    if (!fs::exists(path)) {
      problem = path + ": no such file or directory; expected a scenario file (.walk)";
    }
    if (!problem.empty()) {
      read.problems.push_back(problem);
      continue;
    }
    for (auto& file : found) {
      if (std::find(files.begin(), files.end(), file) == files.end()) files.push_back(file);
    }
  }
  for (const auto& file : files) readFile(file, read);
  return read;
}

}  // namespace qz::tools::scenario
