// SPDX-License-Identifier: MIT
// Small scripts and windows for tests.
#pragma once

#include <initializer_list>
#include <string_view>
#include <utility>

#include "qz/property_list/reader.hpp"
#include "tests/check/script_reading.hpp"
#include "tools/walkthrough/host_window.hpp"

namespace qz::naive::test {

/// Returns the script of a text in the old style.
inline Script script(std::string_view text) { return toolkit::dictionaryFromPropertyList(text); }

/// Returns a window with these controls, back to front.
inline tools::walkthrough::HostWindow window(
    std::initializer_list<std::pair<drivers::ViewKind, toolkit::Tag>> controls) {
  tools::walkthrough::HostWindow host;
  for (const auto& [kind, tag] : controls) {
    auto& control = host.controls.emplace_back();
    control.kind = kind;
    control.tag = tag;
    control.frame = {0, 0, 100, 30};
  }
  return host;
}

}  // namespace qz::naive::test
