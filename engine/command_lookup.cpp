// SPDX-License-Identifier: MIT
// Finds commands in the catalogue.

#include <algorithm>

#include "qz/commands.hpp"
#include "text/uppercase.hpp"

namespace qz {

namespace {

template <class Matches>
const Command* firstCommand(const Matches& matches) {
  const auto all = commandCatalogue();
  const auto found = std::find_if(all.begin(), all.end(), matches);
  return found == all.end() ? nullptr : &*found;
}

const Command* commandNamed(std::string_view name, CommandForm form) {
  return firstCommand([&](const Command& command) {
    return (command.form == form || command.form == CommandForm::both) && command.name == name;
  });
}

}  // namespace

std::optional<std::size_t> Command::positionOf(ParameterType type) const {
  for (std::size_t position = 0; position < parameters.size(); ++position) {
    if (parameters[position].type == type) return position;
  }
  return std::nullopt;
}

const Command* compoundCommandNamed(std::string_view name) {
  std::string raised;
  return commandNamed(text::uppercased(name, raised), CommandForm::compound);
}

const Command* simpleCommandNamed(std::string_view name) {
  return commandNamed(name, CommandForm::simple);
}

const Command* commandOfConstant(std::string_view constant) {
  return firstCommand([&](const Command& command) { return command.constant == constant; });
}

}  // namespace qz
