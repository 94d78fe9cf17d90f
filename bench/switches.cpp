// SPDX-License-Identifier: MIT
#include "bench/switches.hpp"

#include <string>

#include "qz/property_list/reader.hpp"

namespace qz::bench {
namespace {

// The tags of the buttons while their field is hidden, of the buttons while it is shown, and of the
// fields.
constexpr std::size_t offTags = 100;
constexpr std::size_t onTags = 200;
constexpr std::size_t fieldTags = 300;

/// Returns a list that a button runs under `tag`: it acts on the field and re-tags the button.
std::string list(std::size_t tag, const std::string& command, std::size_t field,
                 std::size_t newTag) {
  return std::to_string(tag) + " = ((" + command + ", " + std::to_string(field) +
         "), (SET_TAG_FOR_OBJECT_ID, " + std::to_string(newTag) + ", " + std::to_string(tag) +
         "));\n";
}

tools::walkthrough::HostControl control(drivers::ViewKind kind, std::size_t tag) {
  tools::walkthrough::HostControl control;
  control.kind = kind;
  control.tag = static_cast<toolkit::Tag>(tag);
  control.frame = {0, 0, 90, 20};
  return control;
}

}  // namespace

toolkit::ValueRef<toolkit::Dictionary> switchesScript(std::size_t buttons) {
  std::string script = "{\n" + std::string(switchesStart) + " = (IDLE_LOOP);\n";
  for (std::size_t i = 0; i < buttons; ++i) {
    script += list(offTags + i, "SHOW_OBJECT_WITH_ID", fieldTags + i, onTags + i);
    script += list(onTags + i, "HIDE_OBJECT_WITH_ID", fieldTags + i, offTags + i);
  }
  return toolkit::dictionaryFromPropertyList(script + "}\n");
}

tools::walkthrough::HostWindow switchesWindow(std::size_t buttons) {
  tools::walkthrough::HostWindow window;
  for (std::size_t i = 0; i < buttons; ++i) {
    window.controls.push_back(control(drivers::ViewKind::button, offTags + i));
    window.controls.push_back(control(drivers::ViewKind::textField, fieldTags + i));
    window.controls.back().hidden = true;
  }
  return window;
}

}  // namespace qz::bench
