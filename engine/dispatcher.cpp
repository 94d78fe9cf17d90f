// SPDX-License-Identifier: MIT
// Runs one command for a host, which may change or release everything that it has passed.

#include <string>

#include "engine/command_calls.hpp"
#include "engine/state.hpp"

namespace qz {

QZ_Plist_State_Parser::Parameters commands::ownList(
    const QZ_Plist_State_Parser::Parameters& parameters) {
  if (!parameters) return nullptr;
  const auto elements = parameters->elements();
  return toolkit::Array::make({elements.begin(), elements.end()});
}

// Does not copy the name, because it is not read after the command has started.
bool QZ_Plist_State_Parser::doCompoundCommand(std::string_view name, Parameters withParameters,
                                              ObjectId usingObject) {
  if (const auto other = state_->overridden("doCompoundCommand:withParameters:usingObject:", name,
                                            withParameters, usingObject)) {
    return other->yes;
  }
  const auto kept = keepAlive();
  const Parameters own = commands::ownList(withParameters);
  return commands::runCompound(name, {*this, own, usingObject, state_->toolkit});
}

bool QZ_Plist_State_Parser::doSimpleCommand(std::string_view name, Parameters withParams,
                                            ObjectId usingObject) {
  if (const auto other = state_->overridden("doSimpleCommand:withParams:usingObject:", name,
                                            withParams, usingObject)) {
    return other->yes;
  }
  const auto kept = keepAlive();
  return commands::runSimple(std::string(name), *this, usingObject);
}

}  // namespace qz
