// SPDX-License-Identifier: MIT
// Statements that drive the engine: its operations, a user's presses, and time.

#include <filesystem>
#include <optional>

#include "qz/property_list/reader.hpp"
#include "tools/scenario/statements.hpp"
#include "tools/scenario/unmet.hpp"
#include "tools/scenario/values.hpp"
#include "tools/support/stack_guard.hpp"

namespace qz::tools::scenario {
namespace driving {
namespace {

// --- arguments for the engine; absent if the statement leaves them out or says `none` ---

std::optional<std::string> optionalText(const Arguments& a, std::string_view slot) {
  return a.has(slot) ? std::optional(a.text(slot)) : std::nullopt;
}

Engine::ObjectId objectId(const Arguments& a) {
  return a.has("ID") ? toolkit::Number::withLong(a.whole("ID")) : Engine::ObjectId();
}

Engine::Value value(const Arguments& a, std::string_view slot) {
  if (!a.has(slot)) return {};
  return toValue(readValue(a.word(slot), anyJson).value().value);
}

Engine::Dictionary dictionary(const Arguments& a) {
  return a.has("OBJECT") ? toDictionary(a.word("OBJECT").value) : Engine::Dictionary();
}

Engine::Control control(const Stage& stage, const Arguments& a) {
  return a.has("C") ? stage.cast.control(a.text("C")) : Engine::Control();
}

Engine::Window window(const Stage& stage, const Arguments& a) {
  return a.has("W") ? stage.cast.window(a.text("W")) : Engine::Window();
}

// --- the operations ---

Outcome engine(Stage& stage, const Arguments& a) {
  auto& toolkit = stage.driver.toolkit();
  stage.engines.begin(a.has("plain") ? Engine::init(toolkit)
                                     : Engine::initWithWindow(toolkit, window(stage, a)));
  return {};
}

Outcome adopt(Stage& stage, const Arguments& a) {
  return stage.engines.held()->getGuiAssetsFromWindow(window(stage, a));
}

Outcome assets(Stage& stage, const Arguments& a) {
  const auto description = a.has("entries") ? stage.entries : dictionary(a);
  return stage.engines.held()->loadGuiAssets(description, nullptr);
}

// Returns the script that the engine would read: the stack guard must know it before it runs.
Engine::Dictionary scriptNamed(const std::string& name, const toolkit::Files& files) {
  const auto path = std::filesystem::path(files.resourcePath()) / name;
  const auto contents = files.contentsAtPath(path.string());
  return contents ? toolkit::dictionaryFromPropertyList(*contents) : nullptr;
}

Outcome load(Stage& stage, const Arguments& a) {
  if (a.has("TEXT")) {
    guardScript(*stage.engines.held(), stage.placeOf(*stage.current),
                scriptNamed(a.text("TEXT"), stage.driver.toolkit().files()));
  }
  return stage.engines.held()->loadPlist(optionalText(a, "TEXT"), optionalText(a, "KEY"),
                                         stage.sheetDelegate, a.has("sheet"));
}

Outcome run(Stage& stage, const Arguments& a) {
  return stage.engines.held()->processCommandArray(value(a, "JSON"), objectId(a));
}

Outcome simple(Stage& stage, const Arguments& a) {
  return stage.engines.held()->doSimpleCommand(a.text("TEXT"), toolkit::Array::make(), objectId(a));
}

Outcome compound(Stage& stage, const Arguments& a) {
  return stage.engines.held()->doCompoundCommand(a.text("TEXT"), toolkit::asArray(value(a, "LIST")),
                                                 objectId(a));
}

Outcome press(Stage& stage, const Arguments& a) {
  stage.driver.click(stage.cast.control(a.text("C")));
  return {};
}

Outcome hold(Stage& stage, const Arguments& a) {
  stage.driver.hold(stage.cast.control(a.text("C")));
  return {};
}

Outcome letGo(Stage& stage, const Arguments&) {
  stage.driver.letGo();
  return {};
}

Outcome push(Stage& stage, const Arguments& a) {
  stage.engines.held()->buttonPushed(control(stage, a));
  return {};
}

Outcome advance(Stage& stage, const Arguments& a) {
  stage.driver.advance(a.number("SECONDS"));
  return {};
}

Outcome states(Stage& stage, const Arguments& a) {
  return stage.engines.held()->setButtonSates(dictionary(a));
}

Outcome restore(Stage& stage, const Arguments&) {
  stage.engines.held()->restoreOriginalTagValues();
  return {};
}

Outcome terminate(Stage& stage, const Arguments&) {
  stage.engines.held()->terminateParser();
  return {};
}

Outcome killTimers(Stage& stage, const Arguments&) {
  stage.engines.held()->killAllTimers();
  return {};
}

Outcome wire(Stage& stage, const Arguments& a) {
  return stage.engines.held()->forceButtonPushedToBeActionForGuiAttribute(control(stage, a));
}

Outcome highlight(Stage& stage, const Arguments& a) {
  return stage.engines.held()->QZ_Plist_State_Processor_HIGHLIGHT_ID(objectId(a));
}

Outcome find(Stage& stage, const Arguments& a) {
  return stage.engines.held()->findObjectWithTag(a.whole("TAG"));
}

Outcome timer(Stage& stage, const Arguments& a) {
  stage.engines.held()->startTimerWithValue(a.unsignedWhole("UNSIGNED"), optionalText(a, "KEY"));
  return {};
}

Kept keptTimer(const Stage& stage, const std::string& name) {
  const auto kept = stage.kept.find(name);
  if (kept == stage.kept.end() || !kept->second.timer) {
    throw Unmet("a kept timer", name + ", which is not a timer");
  }
  return kept->second;
}

Outcome fire(Stage& stage, const Arguments& a) {
  const auto fired = a.has("KEPT") ? keptTimer(stage, a.text("KEPT")) : Kept();
  if (fired.isFlasher) {
    stage.engines.held()->flasherFired(fired.timer);
  } else {
    stage.engines.held()->pseudoButtonPush(fired.timer);
  }
  return {};
}

Outcome entry(Stage& stage, const Arguments& a) {
  return stage.engines.held()->createNextGuiAssetEntry(
      &stage.entries, optionalText(a, "TEXT"),
      {a.number("X"), a.number("Y"), a.number("WIDTH"), a.number("HEIGHT")},
      a.unsignedWhole("UNSIGNED"));
}

constexpr StatementKind table[] = {
    {"engine [plain|W]", Result::nothing, engine},
    {"adopt none|W", Result::flag, adopt},
    {"assets none|entries|OBJECT", Result::flag, assets},
    {"load none|TEXT [from KEY] [as sheet]", Result::flag, load},
    {"run none|JSON for none|ID", Result::flag, run},
    {"simple TEXT for none|ID", Result::flag, simple},
    {"compound TEXT none|LIST for none|ID", Result::flag, compound},
    {"press C", Result::nothing, press},
    {"hold C", Result::nothing, hold},
    {"let go", Result::nothing, letGo},
    {"push none|C", Result::nothing, push},
    {"advance SECONDS", Result::nothing, advance},
    {"states none|OBJECT", Result::flag, states},
    {"restore", Result::nothing, restore},
    {"terminate", Result::nothing, terminate},
    {"killtimers", Result::nothing, killTimers},
    {"wire none|C", Result::flag, wire},
    {"highlight none|ID", Result::flag, highlight},
    {"find TAG", Result::control, find},
    {"timer UNSIGNED none|KEY", Result::nothing, timer},
    {"fire none|KEPT", Result::nothing, fire},
    {"entry none|TEXT UNSIGNED X Y WIDTH HEIGHT", Result::flag, entry},
};

}  // namespace
}  // namespace driving

std::span<const StatementKind> drivingStatements() { return driving::table; }

}  // namespace qz::tools::scenario
