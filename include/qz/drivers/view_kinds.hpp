// SPDX-License-Identifier: MIT
// The table of the kinds of view, which drivers, scenarios and the player share.
//
// A new kind is an enumerator and a row here, and a row in the table of each driver, which does not
// compile without it.
#pragma once

#include <cstddef>
#include <cstdint>
#include <iterator>
#include <optional>
#include <string_view>
#include <vector>

#include "qz/api.hpp"
#include "qz/toolkit/class_names.hpp"

namespace qz::drivers {

/// The kinds of view that a driver can make.
enum class ViewKind : std::uint8_t {
  button,
  toggle,
  mixed,
  popUpButton,
  textField,
  imageView,
  box,
  plain
};

/// What a view shows to its user, and a driver's `setCaption` sets.
enum class Caption : std::uint8_t { none, title, text, imageName };

/// What is known of a kind on every toolkit.
struct QZ_API ViewKindRow {
  ViewKind kind;                    ///< what the row is about
  std::string_view name;            ///< in scenarios and host windows, such as "NSButton:toggle"
  std::string_view className;       ///< the standard name of its class, such as "NSButton"
  std::string_view word;            ///< the everyday word, such as "check box"
  Caption caption = Caption::none;  ///< what a user reads on it
  bool isControl = false;           ///< can be disabled, and has a target and an action
  bool isButton = false;            ///< a control that a user presses; it has a title and a state
  bool showsState = false;          ///< a button that looks different when it is on
  bool hasMixedState = false;       ///< a button whose state may be neither on nor off
};

/// The rows, in the order of the enumerators and of the documentation.
inline constexpr ViewKindRow viewKinds[] = {
    {.kind = ViewKind::button,
     .name = "NSButton",
     .className = toolkit::class_names::button,
     .word = "button",
     .caption = Caption::title,
     .isControl = true,
     .isButton = true},
    {.kind = ViewKind::toggle,
     .name = "NSButton:toggle",
     .className = toolkit::class_names::button,
     .word = "check box",
     .caption = Caption::title,
     .isControl = true,
     .isButton = true,
     .showsState = true},
    {.kind = ViewKind::mixed,
     .name = "NSButton:mixed",
     .className = toolkit::class_names::button,
     .word = "mixed check box",
     .caption = Caption::title,
     .isControl = true,
     .isButton = true,
     .showsState = true,
     .hasMixedState = true},
    {.kind = ViewKind::popUpButton,
     .name = "NSPopUpButton",
     .className = toolkit::class_names::popUpButton,
     .word = "pop-up button",
     .caption = Caption::title,
     .isControl = true,
     .isButton = true},
    {.kind = ViewKind::textField,
     .name = "NSTextField",
     .className = toolkit::class_names::textField,
     .word = "text field",
     .caption = Caption::text,
     .isControl = true},
    {.kind = ViewKind::imageView,
     .name = "NSImageView",
     .className = toolkit::class_names::imageView,
     .word = "image",
     .caption = Caption::imageName,
     .isControl = true},
    {.kind = ViewKind::box, .name = "NSBox", .className = toolkit::class_names::box, .word = "box"},
    {.kind = ViewKind::plain,
     .name = "NSView",
     .className = toolkit::class_names::view,
     .word = "view"},
};

/// Whether `rows`, which have a member `kind`, are one row for each kind, in the order of the
/// enumerators. Each driver asserts this of its own table.
template <class Row, std::size_t count>
constexpr bool hasOneRowForEachKind(const Row (&rows)[count]) {
  for (std::size_t i = 0; i < count; ++i) {
    if (rows[i].kind != static_cast<ViewKind>(i)) return false;
  }
  return count == std::size(viewKinds);
}

static_assert(hasOneRowForEachKind(viewKinds));

/// Returns the row of `kind` in a table that has one row for each kind.
template <class Row, std::size_t count>
constexpr const Row& rowOf(const Row (&rows)[count], ViewKind kind) {
  return rows[static_cast<std::size_t>(kind)];
}

/// Returns the row of the kind.
constexpr const ViewKindRow& rowOf(ViewKind kind) { return rowOf(viewKinds, kind); }

/// Whether views of the kind are buttons.
constexpr bool isButton(ViewKind kind) { return rowOf(kind).isButton; }

/// Returns the kind with that name, such as "NSButton:toggle"; absent for any other name.
inline std::optional<ViewKind> viewKindNamed(std::string_view name) {
  for (const ViewKindRow& row : viewKinds) {
    if (row.name == name) return row.kind;
  }
  return std::nullopt;
}

/// Returns every name, in the order of the documentation.
inline std::vector<std::string_view> viewKindNames() {
  std::vector<std::string_view> names;
  for (const ViewKindRow& row : viewKinds) names.push_back(row.name);
  return names;
}

}  // namespace qz::drivers
