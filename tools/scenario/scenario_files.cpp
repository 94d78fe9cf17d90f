// Finding and reading scenario files.

#include "tools/scenario/scenario_files.hpp"

#include <algorithm>
#include <fstream>
#include <optional>
#include <sstream>
#include <system_error>

#include "tools/scenario/statements.hpp"

namespace tools::scenario {
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

std::optional<std::string> contentsOf(const std::string& path) {
  std::ifstream stream(path, std::ios::binary);
  std::ostringstream contents;
  // Reading an empty file out sets the stream's fail bit, which is no error.
  if (stream.peek() != std::ifstream::traits_type::eof()) contents << stream.rdbuf();
  if (!stream.is_open() || stream.bad()) return std::nullopt;
  return contents.str();
}

void readFile(const std::string& path, ReadFiles& read) {
  const auto text = contentsOf(path);
  if (!text) {
    read.problems.push_back(path + ": cannot be read");
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
    if (!fs::exists(path)) problem = path + ": no such file or directory";
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

}  // namespace tools::scenario
