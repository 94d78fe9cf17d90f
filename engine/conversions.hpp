// SPDX-License-Identifier: MIT
// The conversions of a compound command's parameters to the arguments of its processor. Each is
// given the position of its parameter after the name; a position beyond the end raises.
#pragma once

#include <cstddef>
#include <cstdint>
#include <functional>
#include <tuple>
#include <utility>

#include "engine/command_calls.hpp"

namespace qz::commands {

template <std::size_t position>
QZ_Plist_State_Parser::Value valueAt(const CompoundCall& call) {
  return call.at(position);
}
template <std::size_t position>
std::uint64_t integerAt(const CompoundCall& call) {  // a negative one becomes a very large one
  return static_cast<std::uint64_t>(std::int64_t{call.at(position)->intValue()});
}
template <std::size_t position>
QZ_Plist_State_Parser::ObjectId tagAt(const CompoundCall& call) {
  return toolkit::Number::withLong(call.at(position)->intValue());
}
template <std::size_t position>
bool flagAt(const CompoundCall& call) {
  return call.at(position)->boolValue();
}

/// Converts the parameters in the order written, which decides which missing one raises first, then
/// runs the processor.
template <auto processor, auto... conversions>
bool run(const CompoundCall& call) {
  std::tuple<decltype(conversions(call))...> arguments{conversions(call)...};
  return std::apply(
      [&](auto&... argument) {
        return std::invoke(processor, call.engine, std::move(argument)...);
      },
      arguments);
}

}  // namespace qz::commands
