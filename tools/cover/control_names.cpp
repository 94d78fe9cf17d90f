// SPDX-License-Identifier: MIT
#include "tools/cover/control_names.hpp"

#include <algorithm>
#include <set>

#include "tools/scenario/references.hpp"

namespace qz::tools::cover {
namespace {

constexpr std::size_t longestName = 24;

bool canBeName(const std::string& name) {
  scenario::Word word;
  word.text = name;
  return !scenario::Names().whyNotNew(word);
}

/// Returns the name of a control, which others may have too.
std::string firstNameOf(const walkthrough::ControlPicture& control) {
  const auto& row = drivers::rowOf(control.view.kind);
  const std::string title = row.isButton ? control.view.title.string() : "";
  std::string name = slugOf(control.name.empty() ? title : control.name, longestName);
  if (canBeName(name)) return name;
  const std::string kind = slugOf(std::string(row.word), longestName);
  return name.empty() ? kind : kind + "-" + name;
}

}  // namespace

std::string slugOf(const std::string& text, std::size_t length) {
  std::string slug;
  for (const char c : text) {
    const bool isLetter = (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z');
    if (isLetter || (c >= '0' && c <= '9')) {
      slug += isLetter ? static_cast<char>(c | 0x20) : c;
    } else if (!slug.empty() && slug.back() != '-') {
      slug += '-';
    }
  }
  slug.resize(std::min(slug.size(), length));
  while (slug.ends_with('-')) slug.pop_back();
  return slug;
}

std::vector<std::string> controlNames(const walkthrough::StepPicture& picture) {
  std::vector<std::string> names;
  std::set<std::string> taken = {"host", "parent"};  // the windows
  for (const auto& control : picture.controls) {
    const std::string first = firstNameOf(control);
    std::string name = first;
    for (int number = 2; !taken.insert(name).second; ++number) {
      name = first + "-" + std::to_string(number);
    }
    names.push_back(name);
  }
  return names;
}

}  // namespace qz::tools::cover
