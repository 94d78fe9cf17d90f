// SPDX-License-Identifier: MIT
// The files of a source. Their bytes are counted on from one file to the next.
#include "tools/steps/source_files.hpp"

#include <algorithm>

namespace qz::tools::steps {
namespace {

constexpr std::size_t markDistance = 1024;

}  // namespace

std::string FilePlace::text() const {
  return path + ":" + std::to_string(line) + ":" + std::to_string(column);
}

Place SourceFiles::add(const std::string& path, std::string text) {
  // One byte between files: the end of one is not the beginning of the next.
  const Place begin = files_.empty() ? 0 : files_.back().begin + files_.back().text->size() + 1;
  files_.push_back({path, std::make_shared<const std::string>(std::move(text)), begin, {}});
  toolkit::TextCursor cursor(lastText());
  for (std::size_t offset = 0; offset <= lastText().size(); offset += markDistance) {
    cursor.at(offset);
    files_.back().marks.push_back(cursor);
  }
  return begin;
}

const SourceFiles::File& SourceFiles::fileAt(Place place) const {
  const auto next = std::upper_bound(files_.begin(), files_.end(), place,
                                     [](Place p, const File& file) { return p < file.begin; });
  return *std::prev(next);
}

FilePlace SourceFiles::at(Place place) const {
  const File& file = fileAt(place);
  const std::size_t offset = std::min(place - file.begin, file.text->size());
  toolkit::TextCursor cursor = file.marks[offset / markDistance];
  const auto [line, column] = cursor.at(offset);
  return {file.path, line, column};
}

std::vector<std::string> SourceFiles::paths() const {
  std::vector<std::string> paths;
  for (const File& file : files_) paths.push_back(file.path);
  return paths;
}

std::vector<WrittenFile> SourceFiles::written(const toolkit::ValueOffsets& places) const {
  std::vector<toolkit::ValueOffsets> offsets(files_.size());
  for (const auto& [value, place] : places) {
    const File& file = fileAt(place);
    offsets[static_cast<std::size_t>(&file - files_.data())].emplace_back(value,
                                                                          place - file.begin);
  }
  std::vector<WrittenFile> written;
  for (std::size_t i = 0; i < files_.size(); ++i) {
    written.push_back({files_[i].path, {std::move(offsets[i]), *files_[i].text}});
  }
  return written;
}

}  // namespace qz::tools::steps
