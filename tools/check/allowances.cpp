// SPDX-License-Identifier: MIT
#include "tools/check/allowances.hpp"

#include <algorithm>
#include <filesystem>
#include <map>
#include <set>

#include "tools/check/lines.hpp"
#include "tools/support/failure.hpp"
#include "tools/support/suggestions.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::check {
namespace {

bool matches(const Allowance& allowance, const Finding& finding) {
  if (allowance.code != finding.code) return false;
  if (!allowance.key) return true;
  if (finding.list) return finding.list == allowance.key;
  return finding.tag && std::to_string(*finding.tag) == *allowance.key;
}

bool isNeeded(const Allowance& allowance, const std::vector<Finding>& findings) {
  return std::any_of(findings.begin(), findings.end(),
                     [&](const Finding& each) { return matches(allowance, each); });
}

std::string wordsOf(const Allowance& allowance) {
  return allowance.code + (allowance.key ? "=" + *allowance.key : "");
}

}  // namespace

Allowance parseAllowance(std::string_view text, const std::string& source) {
  const auto equals = text.find('=');
  Allowance allowance{.code = std::string(text.substr(0, equals)), .key = {}};
  if (equals != std::string_view::npos) allowance.key = std::string(text.substr(equals + 1));
  if (codeNamed(allowance.code)) return allowance;
  std::vector<std::string_view> names;
  for (const Code& code : codes()) names.push_back(code.name);
  throw Failure(ExitStatus::badInput, source + ": no finding has the code " +
                                          quote(allowance.code) +
                                          didYouMean(allowance.code, names));
}

std::vector<Allowance> readAllowances(const std::string& path) {
  std::vector<Allowance> allowances;
  for (const Line& line : linesOf(path, "allowances")) {
    const FileLine place{path, line.number};
    if (line.words.size() > 1) {
      throw Failure(ExitStatus::badInput, place.text(line.columns[1]) +
                                              ": expected one CODE or CODE=KEY, then a comment "
                                              "that begins with #");
    }
    allowances.push_back(parseAllowance(line.words.front(), place.text(line.columns.front())));
    allowances.back().place = place;
  }
  return allowances;
}

void applyAllowances(std::vector<Finding>& findings, const std::vector<Allowance>& allowances) {
  std::erase_if(findings, [&](const Finding& finding) {
    return std::any_of(allowances.begin(), allowances.end(),
                       [&](const Allowance& each) { return matches(each, finding); });
  });
}

std::vector<Finding> unneededAllowances(const std::vector<Finding>& findings,
                                        const std::vector<Allowance>& allowances) {
  std::vector<Finding> unneeded;
  for (const Allowance& allowance : allowances) {
    if (isNeeded(allowance, findings) || !allowance.place) continue;
    unneeded.push_back(findingOf("unneeded-allowance",
                                 "the allowance " + wordsOf(allowance) + " takes nothing back",
                                 "delete the line"));
    unneeded.back().elsewhere = allowance.place;
  }
  return unneeded;
}

void mergeUnneeded(const std::vector<std::pair<std::string, std::vector<Finding>*>>& scripts) {
  const auto plain = [](const std::string& path) {
    return std::filesystem::absolute(path).lexically_normal();
  };
  const auto lineOf = [&](const Finding& unneeded) {
    return std::pair(plain(unneeded.elsewhere->path), unneeded.elsewhere->line);
  };
  std::map<std::filesystem::path, std::size_t> scriptsIn;
  std::map<std::pair<std::filesystem::path, std::size_t>, std::size_t> reports;  // by allowance
  const auto isUnneeded = [](const Finding& each) { return each.code == "unneeded-allowance"; };
  for (const auto& [path, findings] : scripts) {
    ++scriptsIn[plain(path).parent_path()];
    for (const Finding& each : *findings) {
      if (isUnneeded(each)) ++reports[lineOf(each)];
    }
  }
  std::set<std::pair<std::filesystem::path, std::size_t>> kept;
  for (const auto& [path, findings] : scripts) {
    const std::size_t all = scriptsIn[plain(path).parent_path()];
    std::erase_if(*findings, [&](const Finding& each) {
      if (!isUnneeded(each)) return false;
      const auto line = lineOf(each);
      return reports[line] < all || !kept.insert(line).second;
    });
  }
}

}  // namespace qz::tools::check
