// SPDX-License-Identifier: MIT
// The properties of the engine, of controls and of windows: reads and writes them.
#pragma once

#include <functional>
#include <string>
#include <string_view>
#include <vector>

#include "tools/scenario/stage.hpp"
#include "tools/scenario/vocabulary.hpp"

namespace qz::tools::scenario {

std::vector<PropertyInfo> engineProperties();
std::vector<PropertyInfo> controlProperties();
std::vector<PropertyInfo> windowProperties();

// The parser has checked that the property exists; any other name is a programming error. The
// readers and writers throw an Unmet if something that they need is missing.

/// Returns a function that shows the property's present value even after the property is set to
/// another one; for a table, it shows this very table.
std::function<Reading()> keepEngineProperty(Stage& stage, Engine& engine, std::string_view name);
Reading readControlProperty(Stage& stage, const Cast::View& control, std::string_view name);
Reading readWindowProperty(Stage& stage, const Cast::Window& window, std::string_view name);

void writeEngineProperty(Stage& stage, Engine& engine, std::string_view name, const Wanted& value);
void writeControlProperty(Stage& stage, const Cast::View& control, std::string_view name,
                          const Wanted& value);

/// Returns `engine`, `host` or `other`; absent if `responder` is null.
Reading showResponder(const Stage& stage, const std::shared_ptr<toolkit::Responder>& responder);

/// Shows a timer: its interval, and whether it can still fire.
Reading showTimer(const toolkit::Ref<toolkit::Timer>& timer);

}  // namespace qz::tools::scenario
