// SPDX-License-Identifier: MIT
// The properties of the engine, of controls and of windows: what they show, and what they can be
// set to.
#pragma once

#include <functional>
#include <string>
#include <string_view>
#include <vector>

#include "tools/scenario/stage.hpp"
#include "tools/scenario/vocabulary.hpp"

namespace tools::scenario {

std::vector<PropertyInfo> engineProperties();
std::vector<PropertyInfo> controlProperties();
std::vector<PropertyInfo> windowProperties();

// Of a property that the parser has seen to be there; one that is not is a mistake of ours. The
// readers and writers throw an Unmet when what they need is not there.

/// What shows the property of the engine as it is now, whatever it is later: of a table, that very
/// table.
std::function<Reading()> keepEngineProperty(Stage& stage, Engine& engine, std::string_view name);
Reading readControlProperty(Stage& stage, const Cast::View& control, std::string_view name);
Reading readWindowProperty(Stage& stage, const Cast::Window& window, std::string_view name);

void writeEngineProperty(Stage& stage, Engine& engine, std::string_view name, const Wanted& value);
void writeControlProperty(Stage& stage, const Cast::View& control, std::string_view name,
                          const Wanted& value);

/// `engine`, `host`, `other` or nothing.
Reading showResponder(const Stage& stage, const std::shared_ptr<toolkit::Responder>& responder);

/// A timer as it shows: its interval, and whether it can still fire.
Reading showTimer(const toolkit::Ref<toolkit::Timer>& timer);

}  // namespace tools::scenario
