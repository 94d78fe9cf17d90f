// SPDX-License-Identifier: MIT
// The texts of a source.
#include "tools/steps/texts.hpp"

#include <algorithm>

#include "tools/support/text_layout.hpp"

namespace qz::tools::steps {

std::string Texts::translated(const std::string& text, TextUse use) {
  if (text.empty()) return text;
  use.step = step_;
  const auto [known, isNew] = numbers_.try_emplace(text, list_.size());
  if (isNew) list_.push_back({.text = text});
  Text& noted = list_[known->second];
  if (std::find(noted.uses.begin(), noted.uses.end(), use) == noted.uses.end()) {
    noted.uses.push_back(std::move(use));
  }
  if (!translate_) return text;
  if (!noted.translation) noted.translation = translate_(text);
  return noted.translation->text.value_or(text);
}

std::string lengthened(const std::string& text) {
  // Languages that need more room than English mostly need up to half as much again.
  const std::size_t letters = displayWidth(text);
  std::string more = text;
  for (std::size_t i = 0; i < (letters + 1) / 2; ++i) more += i % 6 == 0 ? " " : "ö";
  return more;
}

}  // namespace qz::tools::steps
