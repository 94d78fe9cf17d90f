// SPDX-License-Identifier: MIT
// Sharing, as docs/steps.md tells it.
#include "tests/steps/sharing.hpp"

#include <algorithm>

namespace qz::meaning {

namespace {

template <class Option>
void orElse(Option& said, const Option& otherwise) {
  if (!said) said = otherwise;
}

/// Adds what is said only otherwise.
template <class Said>
void orElseEach(Said& said, Said& otherwise) {
  std::apply(
      [&](auto&... mine) {
        std::apply([&](auto&... others) { (orElse(mine, others), ...); }, otherwise.options());
      },
      said.options());
}

void fillIn(std::string& text, const Arguments& arguments) {
  for (const auto& [name, value] : arguments) {
    const std::string parameter = "{" + name + "}";
    for (std::size_t at = 0; (at = text.find(parameter, at)) != std::string::npos;
         at += value.size()) {
      text.replace(at, parameter.size(), value);
    }
  }
}

Part filledIn(Part part, const Arguments& arguments) {
  const auto fill = [&](auto& text) {
    if (text) fillIn(*text, arguments);
  };
  for (auto& [name, words] : part.controls) {
    if (words.content) fillIn(words.content->written, arguments);
    for (auto* text : {&words.font, &words.toolTip, &words.color, &words.press}) fill(*text);
  }
  fill(part.background);
  if (part.wait) fillIn(part.wait->go, arguments);
  for (Use& use : part.uses) {
    for (auto& [name, value] : use.arguments) fillIn(value, arguments);
  }
  return part;
}

}  // namespace

Words joined(Words said, Words otherwise) {
  said.isEntry |= otherwise.isEntry;
  orElseEach(said, otherwise);
  return said;
}

Part joined(Part said, Part otherwise) {
  for (const auto& [name, words] : otherwise.controls) {
    said.controls[name] = joined(said.controls[name], words);
  }
  orElseEach(said, otherwise);
  return said;
}

// "A later fragment replaces what an earlier one says, the step itself replaces what fragments say,
// and all replace what `like` says."
Part completed(const Tour& tour, const Part& part, const Arguments& arguments) {
  const Part own = filledIn(part, arguments);
  Part whole = own;
  for (auto use = own.uses.rbegin(); use != own.uses.rend(); ++use) {
    whole = joined(whole, completed(tour, tour.fragments.at(use->fragment), use->arguments));
  }
  if (part.like.empty()) return whole;
  const auto other = std::find_if(tour.steps.begin(), tour.steps.end(),
                                  [&](const auto& step) { return step.first == part.like; });
  return joined(whole, completed(tour, other->second));
}

}  // namespace qz::meaning
