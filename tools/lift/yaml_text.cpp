// SPDX-License-Identifier: MIT
#include "tools/lift/yaml_text.hpp"

#include <algorithm>
#include <cctype>
#include <cstdio>

#include "tools/support/text_layout.hpp"

namespace qz::tools::lift {
namespace {

bool isLetter(char c) {
  const auto byte = static_cast<unsigned char>(c);
  return std::isalpha(byte) != 0 || byte >= 0x80;
}

/// Whether a character means nothing in YAML, wherever it is inside a scalar.
bool isHarmless(char c) {
  const auto byte = static_cast<unsigned char>(c);
  return isLetter(c) || std::isdigit(byte) != 0 ||
         std::string_view(" .;!?'()/+=*_-%$").find(c) != std::string_view::npos;
}

/// Words that some readers of YAML take for something else than a text.
bool isSpecialWord(std::string_view text) {
  static constexpr std::string_view special[] = {"true", "false", "null", "yes", "no",
                                                 "on",   "off",   "y",    "n"};
  std::string lower(text);
  std::transform(lower.begin(), lower.end(), lower.begin(),
                 [](unsigned char c) { return static_cast<char>(std::tolower(c)); });
  return std::find(std::begin(special), std::end(special), lower) != std::end(special);
}

std::string inQuotes(std::string_view text) {
  std::string quoted = "\"";
  for (const char c : text) {
    char code[8];
    switch (c) {
      case '"':
      case '\\':
        quoted += {'\\', c};
        break;
      case '\n':
        quoted += "\\n";
        break;
      case '\t':
        quoted += "\\t";
        break;
      default:
        if (static_cast<unsigned char>(c) >= 0x20 && c != 0x7f) {
          quoted += c;
          break;
        }
        std::snprintf(code, sizeof code, "\\x%02x", static_cast<unsigned char>(c));
        quoted += code;
    }
  }
  return quoted + "\"";
}

std::string joined(const std::vector<std::string>& parts) {
  std::string all;
  for (const std::string& part : parts) all += (all.empty() ? "" : ", ") + part;
  return all;
}

}  // namespace

std::string scalar(std::string_view text) {
  // With a space it is not a number.
  const bool beginsPlain =
      !text.empty() &&
      (isLetter(text.front()) || (std::isdigit(static_cast<unsigned char>(text.front())) != 0 &&
                                  text.find(' ') != std::string::npos));
  const bool isPlain = beginsPlain && text.back() != ' ' &&
                       std::all_of(text.begin(), text.end(), isHarmless) &&
                       printable(text) == text && !isSpecialWord(text);
  return isPlain ? std::string(text) : inQuotes(text);
}

std::string flowTable(const std::vector<std::pair<std::string, std::string>>& entries) {
  std::vector<std::string> parts;
  parts.reserve(entries.size());
  for (const auto& [key, value] : entries) parts.push_back(key + ": " + value);
  return "{" + joined(parts) + "}";
}

std::string flowList(const std::vector<std::string>& elements) {
  return elements.size() == 1 ? elements.front() : "[" + joined(elements) + "]";
}

}  // namespace qz::tools::lift
