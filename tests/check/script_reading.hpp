// SPDX-License-Identifier: MIT
// What can be read off one element of a script, for explorers that compare it with what happens.
#pragma once

#include <optional>

#include "qz/commands.hpp"
#include "qz/drivers/view_kinds.hpp"
#include "qz/property_list/collections.hpp"
#include "qz/toolkit/tag.hpp"

namespace qz::naive {

using Script = toolkit::ValueRef<toolkit::Dictionary>;

/// Returns the command that an element runs; null if it runs none.
const Command* commandOf(const toolkit::ValueRef<>& element);

/// Returns the tag of the control that an element acts on, in the list with the tag `own`. A timer
/// acts on its tag's control. Absent if there is no such command, or it fails before it knows.
std::optional<toolkit::Tag> namedTag(const toolkit::ValueRef<>& element, toolkit::Tag own);

/// Whether reading the element says that it raises: it is malformed, lacks a parameter, has one of
/// a type that raises, or runs a value that is no list.
bool raisesBySight(const toolkit::ValueRef<>& element, const Script& script);

/// Whether a command with this target works on a control of the kind.
bool suits(TargetKind target, drivers::ViewKind kind);

}  // namespace qz::naive
