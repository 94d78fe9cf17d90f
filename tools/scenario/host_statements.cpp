// SPDX-License-Identifier: MIT
// Statements for what the host does in addition to calling the engine: it changes, keeps and
// releases things, and reacts to events.

#include "tools/scenario/properties.hpp"
#include "tools/scenario/references.hpp"
#include "tools/scenario/statements.hpp"
#include "tools/scenario/unmet.hpp"
#include "tools/scenario/wildcard.hpp"

namespace qz::tools::scenario {
namespace host_statements {
namespace {

Outcome setConstant(Stage& stage, const Arguments& a) {
  stage.commands.rename(fullConstantName(a.text("CONSTANT")), a.text("TEXT"));
  return {};
}

/// Returns the value that a statement gives to one of these properties.
Wanted settingOf(const Arguments& a, const std::vector<PropertyInfo>& known,
                 const std::string& property) {
  return readValue(a.word("SETTING"), infoNamed(known, property).written).value();
}

Outcome setProperty(Stage& stage, const Arguments& a) {
  const auto path = splitPath(a.text("SETTABLE"));
  const auto& property = path.property.value();
  if (path.subject == "engine") {
    const Wanted value = settingOf(a, vocabulary().engine, property);
    writeEngineProperty(stage, *stage.engines.held(), property, value);
  } else {
    const Wanted value = settingOf(a, vocabulary().control, property);
    writeControlProperty(stage, stage.cast.control(path.subject), property, value);
  }
  return {};
}

// The host keeps the control alive, so that a scenario can still look at it.
Outcome remove(Stage& stage, const Arguments& a) {
  stage.cast.keep(a.text("C"));
  stage.driver.removeFromSuperview(stage.cast.control(a.text("C")));
  return {};
}

Outcome destroy(Stage& stage, const Arguments& a) {
  const auto& name = a.text("PLACE");
  if (!stage.cast.namesWindow(name)) stage.driver.removeFromSuperview(stage.cast.control(name));
  stage.cast.letGo(name);
  return {};
}

Outcome release(Stage& stage, const Arguments&) {
  stage.engines.release();
  return {};
}

Outcome entries(Stage& stage, const Arguments& a) {
  using toolkit::Dictionary;
  using toolkit::Mutability;
  stage.entries = a.has("none")    ? Engine::Dictionary()
                  : a.has("fixed") ? Dictionary::make({}, Mutability::immutable)
                                   : Dictionary::make();
  return {};
}

Outcome keepProperty(Stage& stage, const Arguments& a) {
  const auto engine = stage.engines.existing();
  const auto property = splitPath(a.text("ENGINE.PROPERTY")).property.value();
  const bool isFlasher = property == "flashingTimer";
  stage.kept[a.text("+NAME")] = {keepEngineProperty(stage, *engine, property),
                                 isFlasher ? engine->flashingTimer() : Engine::Timer(), isFlasher,
                                 infoNamed(vocabulary().engine, property).namesClasses};
  return {};
}

Outcome keepTimer(Stage& stage, const Arguments& a) {
  const auto timer = stage.engines.existing()->objectIdTimers()->objectForKey(a.text("KEY"));
  if (!timer) throw Unmet("an object timer under " + inQuotes(a.text("KEY")), "none");
  stage.kept[a.text("+NAME")] = {[timer] { return showTimer(timer); }, timer, false, false};
  return {};
}

Outcome repeat(Stage& stage, const Arguments& a) {
  for (auto left = a.whole("COUNT"); left > 0; --left) stage.perform(*a.nested());
  return {};
}

// --- reactions ---

using Event = Reactions::Event;

Outcome react(Stage& stage, const Arguments& a, std::string awaited,
              std::function<bool(const Event&)> isFor) {
  stage.reactions.add({std::move(awaited), std::move(isFor), stage.current, a.nested()});
  return {};
}

Outcome whenLog(Stage& stage, const Arguments& a) {
  const auto& pattern = a.text("TEXT");
  return react(stage, a, "a log line " + inQuotes(pattern),
               [&stage, unified = stage.classNames.unified(pattern)](const Event& event) {
                 return event.kind == Event::Kind::log &&
                        matchesPattern(unified, stage.classNames.unified(event.logLine));
               });
}

Outcome whenAction(Stage& stage, const Arguments& a) {
  const auto& name = a.text("C");
  return react(stage, a, "the host's action from " + name, [&stage, name](const Event& event) {
    return event.kind == Event::Kind::action && event.sender == stage.cast.findControl(name);
  });
}

Outcome whenSheetEnds(Stage& stage, const Arguments& a) {
  return react(stage, a, "the end of a sheet",
               [](const Event& event) { return event.kind == Event::Kind::sheetEnd; });
}

constexpr StatementKind table[] = {
    {"set constant CONSTANT TEXT", Result::never, setConstant},
    {"set SETTABLE SETTING", Result::nothing, setProperty},
    {"remove C", Result::nothing, remove},
    {"destroy PLACE", Result::nothing, destroy},
    {"release", Result::nothing, release},
    {"entries none|empty|fixed", Result::never, entries},
    {"keep +NAME timer KEY", Result::never, keepTimer},
    {"keep +NAME ENGINE.PROPERTY", Result::never, keepProperty},
    {"repeat COUNT STATEMENT...", Result::never, repeat},
    {"when log TEXT STATEMENT...", Result::never, whenLog},
    {"when action C STATEMENT...", Result::never, whenAction},
    {"when sheet ends STATEMENT...", Result::never, whenSheetEnds},
};

}  // namespace
}  // namespace host_statements

std::span<const StatementKind> hostStatements() { return host_statements::table; }

}  // namespace qz::tools::scenario
