// SPDX-License-Identifier: MIT
// The property lists that the tool reads.
#include "tools/support/input_file.hpp"

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <filesystem>
#include <new>
#include <utility>

#include "qz/property_list/reader.hpp"
#include "qz/property_list/scalars.hpp"
#include "tools/support/text_layout.hpp"
#include "tools/support/whole_file.hpp"

namespace qz::tools {
namespace {

[[noreturn]] void cannotRead(const std::string& message) {
  throw Failure(ExitStatus::badInput, message);
}

std::string placeIn(const std::string& path, const std::optional<toolkit::Position>& position) {
  if (!position) return path;
  if (const auto* text = std::get_if<toolkit::TextPosition>(&*position)) {
    return path + ":" + std::to_string(text->line) + ":" + std::to_string(text->column);
  }
  return path + ": " + toolkit::description(*position);
}

}  // namespace

std::string requireContents(const std::string& path, const std::string& what) {
  if (path.empty()) cannotRead("empty path; expected the path of " + what);
  std::error_code error;
  const auto status = std::filesystem::status(path, error);
  if (!exists(status)) cannotRead(path + ": no such file; expected " + what);
  if (is_directory(status)) cannotRead(path + ": a directory; expected " + what);
  if (auto contents = wholeFile(path)) return *std::move(contents);
  cannotRead(path + ": cannot be read (" + std::strerror(errno) + "); expected " + what);
}

InputFile::InputFile(std::string path, std::string_view what, ExitStatus refusal)
    : path_(std::move(path)), what_(what), refusal_(refusal) {
  try {
    read(requireContents(path_, what_));
  } catch (const std::bad_alloc&) {
    throw Failure(refusal_, path_ + ": needs more memory than there is; expected " + what_);
  }
}

InputFile::InputFile(std::string path, std::string_view what, toolkit::ValueRef<> root,
                     std::vector<WrittenFile> written)
    : path_(std::move(path)),
      what_(what),
      refusal_(ExitStatus::badInput),
      root_(std::move(root)),
      written_(std::move(written)) {}

InputFile::InputFile(std::string path, std::string_view what, std::string_view contents)
    : path_(std::move(path)), what_(what), refusal_(ExitStatus::badInput) {
  read(contents);
}

void InputFile::read(std::string_view contents) {
  if (contents.empty()) throw Failure(refusal_, path_ + ": an empty file; expected " + what_);
  written_.push_back({.path = path_});
  const auto result = toolkit::readPropertyList(contents, &written_.back().positions);
  if (const auto& refused = result.refusal) {
    throw Failure(refusal_, placeIn(path_, refused->position) + ": " + printable(refused->reason) +
                                " (read as " + std::string(toolkit::description(refused->format)) +
                                ")");
  }
  root_ = result.value;
}

toolkit::ValueRef<toolkit::Dictionary> InputFile::dictionary() const {
  auto dictionary = toolkit::asDictionary(root_);
  if (!dictionary) {
    fail(root_, "expected " + what_ + " (a dictionary), found " + foundWords(root_));
  }
  return dictionary;
}

const WrittenFile* InputFile::writtenFileOf(const toolkit::ValueRef<>& value) const {
  const auto found = std::find_if(written_.begin(), written_.end(), [&](const WrittenFile& file) {
    return file.positions.of(*value).has_value();
  });
  return found == written_.end() ? nullptr : &*found;
}

const std::string& InputFile::pathOf(const toolkit::ValueRef<>& value) const {
  const WrittenFile* const file = writtenFileOf(value);
  return file ? file->path : path_;
}

std::optional<toolkit::Position> InputFile::positionOf(const toolkit::ValueRef<>& value) const {
  const WrittenFile* const file = writtenFileOf(value);
  return file ? file->positions.of(*value) : std::nullopt;
}

std::string InputFile::placeOf(const toolkit::ValueRef<>& value) const {
  return placeIn(pathOf(value), positionOf(value));
}

void InputFile::fail(const toolkit::ValueRef<>& value, const std::string& message) const {
  throw Failure(refusal_, placeOf(value) + ": " + message);
}

std::string foundWords(const toolkit::ValueRef<>& value) {
  switch (value->kind()) {
    case toolkit::Value::Kind::string:
      return "the string " + quote(value->description());
    case toolkit::Value::Kind::number:
      return toolkit::asNumber(value)->type() == toolkit::Number::Type::boolean
                 ? std::string(value->boolValue() ? "YES" : "NO")
                 : "the number " + value->description();
    case toolkit::Value::Kind::date:
      return "a date";
    case toolkit::Value::Kind::data:
      return "data";
    case toolkit::Value::Kind::null:
      return "a null";
    case toolkit::Value::Kind::uid:
      return "a UID";
    case toolkit::Value::Kind::set:
      return "a set";
    case toolkit::Value::Kind::array:
      return value->count() == 0 ? "an empty array"
                                 : "an array of " + std::to_string(value->count());
    case toolkit::Value::Kind::dictionary:
      return value->count() == 0 ? "an empty dictionary" : "a dictionary";
    case toolkit::Value::Kind::nothing:
      break;
  }
  return "nothing";
}

}  // namespace qz::tools
