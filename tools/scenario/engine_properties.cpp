// SPDX-License-Identifier: MIT
// The properties of the engine.

#include <type_traits>
#include <utility>

#include "qz/toolkit/table.hpp"
#include "tools/scenario/properties.hpp"
#include "tools/scenario/property_table.hpp"
#include "tools/scenario/values.hpp"

namespace qz::tools::scenario {
namespace engine_properties {
namespace {

// --- reading the engine's types ---

Reading show(const Stage&, bool flag) { return Json(flag); }

Reading show(const Stage& stage, const Engine::Window& window) {
  const auto name = stage.cast.nameOf(window);
  return name ? Reading(Json(*name)) : std::nullopt;
}

template <class T>
Reading show(const Stage&, const toolkit::ValueRef<T>& value) {
  return value ? Reading(toJson(value)) : std::nullopt;
}

Reading show(const Stage&, const Engine::Timer& timer) { return showTimer(timer); }

Reading show(const Stage&, const Engine::Controls& controls) {
  if (!controls) return std::nullopt;
  auto names = Json::array();
  for (const auto& control : controls->elements()) names.push_back(control->className());
  return names;
}

Reading show(const Stage&, const Engine::Timers& timers) {
  if (!timers) return std::nullopt;
  auto intervals = Json::object();
  for (const auto& [key, timer] : timers->entries()) {
    addMember(intervals, key, timer->interval());
  }
  return intervals;
}

// Null replaces the tag of a control that is gone.
Reading show(const Stage&, const Engine::GuiAssets& assets) {
  if (!assets) return std::nullopt;
  auto records = Json::object();
  for (const auto& [key, record] : assets->entries()) {
    const auto control = record.control.get();
    addMember(records, key,
              {record.classNames[0], record.frame, control ? Json(control->tag()) : Json()});
  }
  return records;
}

// --- writing ---

template <class T>
struct Written {};

template <>
struct Written<bool> {
  static bool from(const Stage&, const Wanted& value) { return value.value.get<bool>(); }
};

template <>
struct Written<Engine::Window> {
  static Engine::Window from(const Stage& stage, const Wanted& value) {
    if (value.kind == Wanted::Kind::absent) return {};
    return stage.cast.window(value.value.get<std::string>());
  }
};

template <>
struct Written<Engine::Dictionary> {
  static Engine::Dictionary from(const Stage&, const Wanted& value) {
    if (value.kind == Wanted::Kind::absent) return {};
    if (value.kind == Wanted::Kind::empty) return toolkit::Dictionary::make();
    return toDictionary(value.value);
  }
};

template <>
struct Written<Engine::Value> {
  static Engine::Value from(const Stage&, const Wanted& value) {
    return value.kind == Wanted::Kind::absent ? Engine::Value() : toValue(value.value);
  }
};

template <>
struct Written<Engine::ObjectId> {
  static Engine::ObjectId from(const Stage&, const Wanted& value) {
    return value.kind == Wanted::Kind::absent ? Engine::ObjectId()
                                              : toolkit::asNumber(toValue(value.value));
  }
};

template <>
struct Written<Engine::Timer> {
  static Engine::Timer from(const Stage&, const Wanted&) { return {}; }
};

/// A table of things that are not values can only be made empty.
template <class T>
struct Written<toolkit::Ref<T>> {
  static toolkit::Ref<T> from(const Stage&, const Wanted& value) {
    return value.kind == Wanted::Kind::absent ? toolkit::Ref<T>() : T::make();
  }
};

// --- the table ---

using Reader = std::function<Reading()>;

template <auto get>
Reader keep(const Stage& stage, const Engine& engine) {
  return [&stage, value = (engine.*get)()] { return show(stage, value); };
}

template <auto set>
struct Setter;

template <class Argument, void (Engine::*set)(Argument)>
struct Setter<set> {
  static void write(const Stage& stage, Engine& engine, const Wanted& value) {
    (engine.*set)(Written<std::remove_cvref_t<Argument>>::from(stage, value));
  }
};

template <auto set>
constexpr auto write = &Setter<set>::write;

struct Property {
  PropertyInfo info;
  Reader (*keep)(const Stage& stage, const Engine& engine);
  void (*write)(const Stage& stage, Engine& engine, const Wanted& value);
};

constexpr Takes flag = Takes::flag;
constexpr Takes object = Takes::object;
constexpr Takes whole = Takes::whole;
constexpr Takes window = Takes::window;
constexpr Takes absent = Takes::absent;
constexpr Takes empty = Takes::empty;
constexpr Takes shown = Takes::absent | Takes::present;
constexpr Takes table = Takes::absent | Takes::present | Takes::empty;

// clang-format off
constexpr Property properties[] = {
    {{"flashing", flag, flag}, keep<&Engine::flashing>, write<&Engine::setFlashing>},
    {{"runningAsSheet", flag, flag}, keep<&Engine::runningAsSheet>, write<&Engine::setRunningAsSheet>},
    {{"terminating", flag, flag}, keep<&Engine::terminating>, write<&Engine::setTerminating>},
    {{"hasTerminated", flag, flag}, keep<&Engine::hasTerminated>, write<&Engine::setHasTerminated>},
    {{"window", window | shown, window | absent}, keep<&Engine::window>, write<&Engine::setWindow>},
    {{"plistDictionary", object | table, object | absent | empty}, keep<&Engine::plistDictionary>, write<&Engine::setPlistDictionary>},
    {{"commandArray", anyJson | table, anyJson | absent}, keep<&Engine::commandArray>, write<&Engine::setCommandArray>},
    {{"objectId", whole | shown, whole | absent}, keep<&Engine::objectId>, write<&Engine::setObjectId>},
    {{"flashingTimer", object | shown, absent}, keep<&Engine::flashingTimer>, write<&Engine::setFlashingTimer>},
    {{"flashingTagIds", object | table, object | absent | empty}, keep<&Engine::flashingTagIds>, write<&Engine::setFlashingTagIds>},
    {{"tutorialWindow", window | shown, window | absent}, keep<&Engine::tutorialWindow>, write<&Engine::setTutorialWindow>},
    {{"addedObjectToTutorial", Takes::list | table, absent | empty, true}, keep<&Engine::addedObjectToTutorial>, write<&Engine::setAddedObjectToTutorial>},
    {{"guiAssets", object | table, absent | empty, true}, keep<&Engine::guiAssets>, write<&Engine::setGuiAssets>},
    {{"lastTagId", whole | shown, whole | absent}, keep<&Engine::lastTagId>, write<&Engine::setLastTagId>},
    {{"objectIdTimers", object | table, absent | empty}, keep<&Engine::objectIdTimers>, write<&Engine::setObjectIdTimers>},
    {{"buttonStates", object | table}, keep<&Engine::buttonStates>, nullptr},
    {{"originalTagValues", object | table, object | absent | empty}, keep<&Engine::originalTagValues>, write<&Engine::setOriginalTagValues>},
};
// clang-format on

}  // namespace
}  // namespace engine_properties

std::vector<PropertyInfo> engineProperties() { return infosOf(engine_properties::properties); }

std::function<Reading()> keepEngineProperty(Stage& stage, Engine& engine, std::string_view name) {
  return rowNamed(engine_properties::properties, name).keep(stage, engine);
}

void writeEngineProperty(Stage& stage, Engine& engine, std::string_view name, const Wanted& value) {
  rowNamed(engine_properties::properties, name).write(stage, engine, value);
}

Reading showTimer(const toolkit::Ref<toolkit::Timer>& timer) {
  if (!timer) return std::nullopt;
  return Json{{"interval", timer->interval()}, {"valid", timer->isValid()}};
}

}  // namespace qz::tools::scenario
