// SPDX-License-Identifier: MIT
// How statements refer to things.

#include "tools/scenario/references.hpp"

#include <algorithm>
#include <charconv>
#include <iterator>

namespace qz::tools::scenario {
namespace {

// Words that mean something else where a name is expected.
constexpr std::string_view reservedNames[] = {"absent", "delegate", "engine", "entries",
                                              "log",    "none",     "plain",  "present",
                                              "state",  "tutorial"};

template <class Integer>
std::optional<Integer> integerBehind(char sign, std::string_view text) {
  if (text.empty() || text.front() != sign) return std::nullopt;
  Integer value = 0;
  const auto* const end = text.data() + text.size();
  const auto [stop, error] = std::from_chars(text.data() + 1, end, value);
  if (error != std::errc() || stop != end) return std::nullopt;
  return value;
}

bool isNameCharacter(char c) {
  const auto byte = static_cast<unsigned char>(c);
  return byte >= 0x80 || c == '_' || c == '-' || (c >= '0' && c <= '9') || (c >= 'a' && c <= 'z') ||
         (c >= 'A' && c <= 'Z');
}

bool isName(std::string_view text) {
  if (text.empty() || text.front() == '-' || (text.front() >= '0' && text.front() <= '9')) {
    return false;
  }
  return std::all_of(text.begin(), text.end(), isNameCharacter);
}

}  // namespace

std::optional<toolkit::Tag> tagIn(std::string_view text) {
  return integerBehind<toolkit::Tag>('#', text);
}

std::optional<std::size_t> indexIn(std::string_view text) {
  return integerBehind<std::size_t>('@', text);
}

Path splitPath(std::string_view text) {
  Path path;
  const auto dot = text.find('.');
  path.subject = text.substr(0, dot);
  if (dot == std::string_view::npos) return path;
  const auto second = text.find('.', dot + 1);
  path.property = text.substr(dot + 1, second - dot - 1);
  if (second != std::string_view::npos) path.key = text.substr(second + 1);
  return path;
}

std::string_view describe(NameKind kind) {
  switch (kind) {
    case NameKind::window:
      return "a window";
    case NameKind::control:
      return "a control";
    case NameKind::kept:
      break;
  }
  return "a kept value";
}

std::optional<std::string> Names::whyNotNew(const Word& word) const {
  const auto shown = inQuotes(word.text);
  if (!isName(word.text)) {
    return shown +
           " is not a name; names consist of letters, digits, _ and -, and begin with a "
           "letter or _";
  }
  if (std::ranges::find(reservedNames, word.text) != std::end(reservedNames)) {
    return shown + " is reserved; use another name";
  }
  if (const auto found = names_.find(word.text); found != names_.end()) {
    return shown + " is already " + std::string(describe(found->second.kind)) + ", since line " +
           std::to_string(found->second.line);
  }
  return std::nullopt;
}

void Names::declare(const Word& word, NameKind kind) {
  names_.insert_or_assign(word.text, Declared{kind, word.at.line});
}

std::optional<NameKind> Names::kindOf(std::string_view name) const {
  if (name == "tutorial") return NameKind::window;
  if (tagIn(name) || indexIn(name)) return NameKind::control;
  const auto found = names_.find(name);
  if (found == names_.end()) return std::nullopt;
  return found->second.kind;
}

std::vector<std::string_view> Names::all() const {
  std::vector<std::string_view> names;
  for (const auto& [name, declared] : names_) names.push_back(name);
  return names;
}

}  // namespace qz::tools::scenario
