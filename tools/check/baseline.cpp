// SPDX-License-Identifier: MIT
#include "tools/check/baseline.hpp"

#include <nlohmann/json.hpp>

#include <algorithm>
#include <filesystem>

#include "tools/support/failure.hpp"
#include "tools/support/replace_file.hpp"
#include "tools/support/whole_file.hpp"

namespace qz::tools::check {
namespace {

using Json = nlohmann::ordered_json;

constexpr int version = 1;

}  // namespace

Baseline Baseline::read(const std::string& path) {
  Baseline baseline(path);
  if (std::filesystem::is_directory(path)) {
    throw Failure(ExitStatus::badInput, path + ": a directory; expected a baseline");
  }
  const auto text = wholeFile(path);
  if (!text) {
    throw Failure(ExitStatus::badInput,
                  path + ": cannot be read; --update-baseline writes a baseline");
  }
  try {
    const Json root = Json::parse(*text);
    if (root.at("version") != version) throw std::runtime_error("another version");
    for (const auto& [script, entries] : root.at("scripts").items()) {
      for (const Json& each : entries) {
        const Entry entry{each.at("code"), each.value("list", ""), each.value("tag", ""),
                          each.value("expectation", "")};
        baseline.scripts_[script][entry] = {each.value("count", std::size_t{1}),
                                            each.value("message", "")};
      }
    }
  } catch (const std::exception&) {
    throw Failure(ExitStatus::badInput, path +
                                            ": expected a baseline, as --update-baseline writes "
                                            "it, found another file");
  }
  return baseline;
}

std::size_t Baseline::takeBack(const std::string& script, std::vector<Finding>& findings) const {
  const auto known = scripts_.find(nameOf(script));
  if (known == scripts_.end()) return 0;
  Entries left = known->second;
  return std::erase_if(findings, [&](const Finding& finding) {
    const auto entry = left.find(entryOf(finding));
    if (entry == left.end() || entry->second.count == 0) return false;
    --entry->second.count;
    return true;
  });
}

void Baseline::replace(const std::string& script, const std::vector<Finding>& findings) {
  Entries& entries = scripts_[nameOf(script)];
  entries.clear();
  for (const Finding& finding : findings) {
    Known& known = entries[entryOf(finding)];
    if (++known.count == 1) known.message = finding.message;
  }
  if (entries.empty()) scripts_.erase(nameOf(script));
}

void Baseline::write() const {
  Json root{{"version", version}, {"scripts", Json::object()}};
  for (const auto& [script, entries] : scripts_) {
    Json& list = root["scripts"][script] = Json::array();
    for (const auto& [entry, known] : entries) {
      Json each{{"code", entry.code}};
      if (!entry.list.empty()) each["list"] = entry.list;
      if (!entry.tag.empty()) each["tag"] = entry.tag;
      if (!entry.expectation.empty()) each["expectation"] = entry.expectation;
      if (known.count > 1) each["count"] = known.count;
      each["message"] = known.message;
      list.push_back(std::move(each));
    }
  }
  const auto text = root.dump(2, ' ', false, Json::error_handler_t::replace) + "\n";
  replaceFile(path_, text);
}

Baseline::Entry Baseline::entryOf(const Finding& finding) {
  return {finding.code, finding.list.value_or(""),
          finding.tag ? std::to_string(*finding.tag) : std::string(), finding.expectation};
}

std::string Baseline::nameOf(const std::string& script) const {
  const auto folder = std::filesystem::absolute(path_).lexically_normal().parent_path();
  const auto file = std::filesystem::absolute(script).lexically_normal();
  return file.lexically_proximate(folder).generic_string();
}

}  // namespace qz::tools::check
