// SPDX-License-Identifier: MIT
// The kinds of view by name.
#include "tools/view_kinds.hpp"

#include <array>

namespace tools {
namespace {

using toolkit::ViewKind;

struct NamedKind {
  std::string_view name;
  ViewKind kind;
};

constexpr std::array<NamedKind, 8> namedKinds = {{{"NSButton", ViewKind::button},
                                                  {"NSButton:toggle", ViewKind::toggle},
                                                  {"NSButton:mixed", ViewKind::mixed},
                                                  {"NSPopUpButton", ViewKind::popUpButton},
                                                  {"NSTextField", ViewKind::textField},
                                                  {"NSImageView", ViewKind::imageView},
                                                  {"NSBox", ViewKind::box},
                                                  {"NSView", ViewKind::plain}}};

}  // namespace

std::optional<ViewKind> viewKindNamed(std::string_view name) {
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

}  // namespace tools
