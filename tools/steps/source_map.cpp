// SPDX-License-Identifier: MIT
// Where the lists and commands of a built script come from.
#include "tools/steps/source_map.hpp"

#include <nlohmann/json.hpp>

#include <filesystem>

namespace qz::tools::steps {
namespace {

using Json = nlohmann::ordered_json;

/// Returns a path as it is seen from the directory of `source`.
std::string relativeTo(const std::string& source, const std::string& path) {
  const auto folder = std::filesystem::path(source).parent_path();
  return std::filesystem::path(path).lexically_proximate(folder).generic_string();
}

Json placeOf(const InputFile& file, const toolkit::ValueRef<>& value) {
  const auto [line, column] = std::get<toolkit::TextPosition>(*file.positionOf(value));
  Json place = Json::object();
  if (file.pathOf(value) != file.path())
    place["file"] = relativeTo(file.path(), file.pathOf(value));
  place["line"] = line;
  place["column"] = column;
  return place;
}

Json listOf(const InputFile& file, const toolkit::Dictionary::Entry& entry,
            const walkthrough::Names& names) {
  Json list = placeOf(file, entry.key);
  const std::string step = names.stepOf(entry.key->description());
  if (!step.empty()) list["step"] = step;
  list["commands"] = Json::array();
  for (const auto& command : toolkit::asArray(entry.value)->elements()) {
    list["commands"].push_back(placeOf(file, command));
  }
  return list;
}

Json listsOf(const InputFile& file, const walkthrough::Names& names) {
  Json lists = Json::object();
  const auto dictionary = file.dictionary();  // held: its entries live only as long
  for (const auto& entry : dictionary->entries()) {
    lists[entry.key->description()] = listOf(file, entry, names);
  }
  return lists;
}

}  // namespace

std::string sourceMap(const ScriptFile& script) {
  const walkthrough::Names names = script.names();
  Json controls = Json::object();
  for (const auto& [tag, name] : names.controls) controls[std::to_string(tag)] = name;
  const Json map = {{"version", 1},
                    {"source", std::filesystem::path(script.file.path()).filename().string()},
                    {"controls", controls},
                    {"lists", listsOf(script.file, names)}};
  return map.dump(1) + "\n";
}

}  // namespace qz::tools::steps
