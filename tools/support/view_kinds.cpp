// SPDX-License-Identifier: MIT
// The kinds of view by name.
#include "tools/support/view_kinds.hpp"

#include <array>

namespace qz::tools {
namespace {

using drivers::ViewKind;

struct NamedKind {
  std::string_view name;
  drivers::ViewKind kind;
};

constexpr std::array<NamedKind, 8> namedKinds = {{{"NSButton", drivers::ViewKind::button},
                                                  {"NSButton:toggle", drivers::ViewKind::toggle},
                                                  {"NSButton:mixed", drivers::ViewKind::mixed},
                                                  {"NSPopUpButton", drivers::ViewKind::popUpButton},
                                                  {"NSTextField", drivers::ViewKind::textField},
                                                  {"NSImageView", drivers::ViewKind::imageView},
                                                  {"NSBox", drivers::ViewKind::box},
                                                  {"NSView", drivers::ViewKind::plain}}};

}  // namespace

std::optional<drivers::ViewKind> viewKindNamed(std::string_view name) {
  for (const NamedKind& named : namedKinds) {
    if (named.name == name) return named.kind;
  }
  return std::nullopt;
}

std::vector<std::string_view> viewKindNames() {
  std::vector<std::string_view> names;
  names.reserve(namedKinds.size());
  for (const NamedKind& named : namedKinds) names.push_back(named.name);
  return names;
}

}  // namespace qz::tools
