// SPDX-License-Identifier: MIT
// The files of a source: its own and those that it includes.
#pragma once

#include <memory>
#include <string>
#include <vector>

#include "qz/property_list/format_readers.hpp"
#include "qz/property_list/positions.hpp"
#include "tools/steps/place.hpp"
#include "tools/support/input_file.hpp"

namespace qz::tools::steps {

/// A place in words that people use.
struct FilePlace {
  std::string path{};
  std::size_t line = 1;    ///< from 1
  std::size_t column = 1;  ///< from 1, in characters

  /// Returns "PATH:LINE:COLUMN".
  std::string text() const;
};

class SourceFiles {
 public:
  /// Adds a file, and returns the place of its first byte.
  Place add(const std::string& path, std::string text);
  /// Returns the text of the file that was added last; it lives as long as this or a copy of it.
  std::string_view lastText() const { return *files_.back().text; }

  /// Returns where a place is. There must be a file.
  FilePlace at(Place place) const;
  /// Returns the paths of all files, that of the source itself first.
  std::vector<std::string> paths() const;
  /// Returns, for each file, where values that were made of it are written.
  std::vector<WrittenFile> written(const toolkit::ValueOffsets& places) const;

 private:
  struct File {
    std::string path;
    std::shared_ptr<const std::string> text;
    Place begin;
    /// Cursors at regular distances, so that no place needs the whole text before it.
    std::vector<toolkit::TextCursor> marks;
  };

  const File& fileAt(Place place) const;

  std::vector<File> files_;
};

}  // namespace qz::tools::steps
