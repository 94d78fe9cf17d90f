// SPDX-License-Identifier: MIT
// The entries of a source, together with those of the files that it includes.
#pragma once

#include <functional>
#include <map>
#include <optional>
#include <set>
#include <string>

#include "tools/steps/source_files.hpp"
#include "tools/steps/yaml.hpp"

namespace qz::tools::steps {

/// Returns the text of the file at a path; absent if it cannot be read.
using ReadText = std::function<std::optional<std::string>(const std::string& path)>;

class Parts {
 public:
  /// All must outlive this.
  Parts(SourceFiles& files, const ReadText& readText, Mistakes& mistakes)
      : files_(files), readText_(readText), mistakes_(mistakes) {}

  /// Reads a file, then those that it includes. The entries of one come after those of the other.
  /// What is wrong is a mistake.
  void read(const std::string& path, std::string text);
  /// Whether all files could be read as YAML, so that what is absent is missing.
  bool areWhole() const { return areWhole_; }
  /// Returns an entry by its word; null if no file has it.
  NodeRef part(const std::string& word) const;

 private:
  void include(const Node& what, const std::string& from);
  void includeFile(const Node& name, const std::string& from);
  void readIncluded(const Node& name, const std::string& path);
  void join(const Node& word, const NodeRef& value);
  NodeRef joined(const Node& before, const Node& more);
  void refuseSecond(const Node& second, Place first);

  SourceFiles& files_;
  const ReadText& readText_;
  Mistakes& mistakes_;
  std::set<std::string> known_;  // the paths of all files
  std::set<std::string> open_;   // of those that are being read
  bool areWhole_ = true;
  std::map<std::string, NodeRef> parts_;
};

}  // namespace qz::tools::steps
