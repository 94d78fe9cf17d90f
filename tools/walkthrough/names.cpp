// SPDX-License-Identifier: MIT
// Puts names into pictures.
#include "tools/walkthrough/names.hpp"

#include "tools/support/text_layout.hpp"
#include "tools/walkthrough/parse_number.hpp"

namespace qz::tools::walkthrough {
namespace {

template <class Key>
std::string nameIn(const std::map<Key, std::string>& names, const Key& key) {
  const auto found = names.find(key);
  return found == names.end() ? std::string() : found->second;
}

}  // namespace

std::string Names::controlWords(toolkit::Tag tag) const {
  const std::string name = nameIn(controls, tag);
  return name.empty() ? std::to_string(tag) : quote(name);
}

std::string Names::stepOf(const std::string& key) const { return nameIn(steps, key); }

std::string Naming::controlName(const std::string& tag) const {
  const auto number = parseNumber<toolkit::Tag>(tag);
  const std::string name = number ? nameIn(names_.controls, *number) : "";
  return name.empty() ? tag : name;
}

void Naming::apply(StepPicture& picture) {
  for (ControlPicture& control : picture.controls) {
    control.name = nameIn(names_.controls, control.view.tag);
  }
  for (TimerPicture& timer : picture.timers) timer.step = nameIn(names_.steps, timer.key);
  const std::string step = picture.lastList ? nameIn(names_.steps, *picture.lastList) : "";
  if (!step.empty()) step_ = step;
  picture.step = step_;
}

}  // namespace qz::tools::walkthrough
