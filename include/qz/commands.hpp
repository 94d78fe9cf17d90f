// SPDX-License-Identifier: MIT
// The catalogue of the script's commands: what each is called, which parameters it takes, and what
// it does. For hosts and tools that list, complete or check commands.
#pragma once

#include <cstddef>
#include <optional>
#include <span>
#include <string>
#include <string_view>

#include "qz/api.hpp"

namespace qz {

/// What a parameter of a command means, which decides the values that it may have.
enum class ParameterType {
  controlTag,        ///< integer: the tag of the control that the command acts on
  listTag,           ///< integer: the key of a list
  controlOrListTag,  ///< integer: the tag of a control, or the key of a list
  newTag,            ///< integer: the tag that a control gets
  seconds,           ///< integer: a time in whole seconds
  points,            ///< integer: the size of a font in whole points; 0 means the default size
  integer,           ///< integer: a number of no other type
  flag,              ///< boolean
  text,              ///< string: plain text
  html,              ///< string: a fragment of HTML, in ASCII; other values are read as their text
  fontName,          ///< string: the name of a font of the toolkit
  imageName,         ///< string: the name of an image in the resource directory; not a path
  colorName,         ///< string: one of the colour names of the language
  anything,          ///< any value: it must be there, but its meaning does not matter
};

/// A parameter of a command.
struct QZ_API CommandParameter {
  std::string_view name;     ///< what the documentation calls the parameter
  ParameterType type;        ///< what the engine converts it to
  std::string_view meaning;  ///< one line in plain English
  bool isOptional = false;   ///< whether a list may leave it out
};

/// How a script may write a command: as a string (simple), or as an array of the name and the
/// parameters (compound).
enum class CommandForm {
  none,  ///< the name is declared for hosts only: no command of this name is recognised
  simple,
  compound,
  both,
};

/// The kind of control that a command works on. On another control it does nothing visible, or
/// raises.
enum class TargetKind {
  none,  ///< the command acts on no control
  anyView,
  anyControl,
  button,
  buttonWithState,  ///< such as a check box
  imageView,
  textField,
};

/// What a compound command does if it gets more parameters than it takes.
enum class ExtraParameters {
  ignored,           ///< runs as without them
  overrideTheTag,    ///< ignores the optional tag as well, and acts as if that was missing
  preventTheCommand  ///< does nothing, with the result NO
};

/// What happens after a command to the run of its list.
enum class CommandFlow {
  continues,        ///< the list continues
  runsList,         ///< another list runs first; the simple form runs its own list again
  endsWalkThrough,  ///< the list continues without a script, so that it runs no other list
};

/// A command, as `commandCatalogue` lists it.
struct QZ_API Command {
  /// Returns the position of the first parameter of this type, counted from 0 after the name;
  /// absent if there is none.
  ///
  /// `positionOf(ParameterType::controlTag)` is the parameter that names the target. Without such a
  /// parameter, also in the simple form, the target is the control whose tag is the key of the
  /// list.
  std::optional<std::size_t> positionOf(ParameterType type) const;

  std::string_view constant;  ///< the name of the constant, such as QZ_PLIST_STATE_PARSER_FLASH_ID
  std::string& name;          ///< the constant: the current name of the command in scripts
  std::string_view summary;   ///< what the command does, in one line of plain English
  CommandForm form;           ///< whether a list writes it as a string or as an array
  std::span<const CommandParameter> parameters;  ///< of the compound form
  TargetKind target;                             ///< the kind of control that it works on
  ExtraParameters extraParameters;               ///< what it does with more parameters
  CommandFlow flow;                              ///< what happens to its list afterwards
};

/// Returns all commands, in the order in which the engine compares their names. Each constant has
/// exactly one entry. The entries live until the program ends.
QZ_API std::span<const Command> commandCatalogue();

/// Returns the command that the engine runs for an array with this name, in any case; null if there
/// is none. If a host has given two commands the same name, the engine runs the first one.
QZ_API const Command* compoundCommandNamed(std::string_view name);

/// Returns the command that the engine runs for this string, which is compared as written; null if
/// there is none.
QZ_API const Command* simpleCommandNamed(std::string_view name);

/// Returns the command of a constant, such as "QZ_PLIST_STATE_PARSER_FLASH_ID". A new name of the
/// command changes nothing here. Null if no constant has this name.
QZ_API const Command* commandOfConstant(std::string_view constant);

/// Returns the values that a parameter of the type `colorName` may have.
QZ_API std::span<const std::string_view> titleColorNames();

}  // namespace qz
