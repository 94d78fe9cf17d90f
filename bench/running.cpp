// SPDX-License-Identifier: MIT
// Measures command lists over few and many controls on the memory toolkit, against the direct
// toolkit calls and Lua; also a press, a tick of the flasher, and discovery.
#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <memory>
#include <string>
#include <vector>

#include "bench/direct_walkthrough.hpp"
#include "bench/lua_walkthrough.hpp"
#include "bench/measuring.hpp"
#include "bench/operations.hpp"
#include "drivers/memory/memory_driver.hpp"
#include "qz/engine.hpp"
#include "qz/property_list/binary_writer.hpp"
#include "qz/property_list/reader.hpp"

namespace qz {

namespace {

using bench::Operation;
using bench::What;
using toolkit::Number;
using toolkit::String;
using List = toolkit::ValueRef<toolkit::Array>;

/// A window of buttons with the tags 1 … `controls`, which an engine has adopted.
struct Stage {
  explicit Stage(long controls) {
    driver.setLogSink([](std::string_view) {});
    for (toolkit::Tag tag = 1; tag <= controls; ++tag) {
      driver.makeView(drivers::ViewKind::toggle, tag, {0, 0, 90, 20}, window->contentView());
    }
    engine->getGuiAssetsFromWindow(window);
  }
  ~Stage() { engine->terminateParser(); }
  Stage(const Stage&) = delete;
  Stage& operator=(const Stage&) = delete;

  drivers::MemoryDriver driver;
  toolkit::Ref<toolkit::Window> window = driver.makeWindow({0, 0, 800, 600});
  std::shared_ptr<QZ_Plist_State_Parser> engine =
      QZ_Plist_State_Parser::initWithWindow(driver.toolkit(), window);
};

/// Returns `count` commands, all sorts in turn, spread over the controls.
std::vector<Operation> operationsOver(long controls, std::size_t count) {
  constexpr What sorts[] = {What::text,   What::title,   What::toolTip,
                            What::enable, What::disable, What::stateOn};
  constexpr long step = 7919;  // a prime, so that every control gets a turn
  std::vector<Operation> operations;
  for (std::size_t i = 0; i < count; ++i) {
    const toolkit::Tag tag = 1 + static_cast<long>(i) * step % controls;
    operations.push_back(
        {sorts[i % std::size(sorts)], tag, "Take the cup off the tray, step " + std::to_string(i)});
  }
  return operations;
}

toolkit::ValueRef<> commandOf(const Operation& operation) {
  const auto make = [&](const char* name, bool hasText) {
    std::vector<toolkit::ValueRef<>> elements{String::make(name)};
    if (hasText) elements.emplace_back(String::make(operation.text));
    elements.emplace_back(Number::withLong(operation.tag));
    return toolkit::Array::make(std::move(elements));
  };
  switch (operation.what) {
    case What::text:
      return make("SET_TEXT_FOR_OBJECT_ID", true);
    case What::title:
      return make("SET_TITLE_FOR_OBJECT_ID", true);
    case What::toolTip:
      return make("SET_TOOL_TIP_FOR_ID", true);
    case What::enable:
      return make("ENABLE_OBJECT_WITH_ID", false);
    case What::disable:
      return make("DISABLE_OBJECT_WITH_ID", false);
    case What::stateOn:
      return make("SET_STATE_ON_FOR_OBJECT_ID", false);
  }
  return nullptr;
}

/// Returns the operations as a script's list, read from the bytes of a file like a real script.
List listOf(const std::vector<Operation>& operations) {
  std::vector<toolkit::ValueRef<>> commands;
  for (const Operation& operation : operations) commands.push_back(commandOf(operation));
  const auto file = toolkit::writeBinaryPropertyList(toolkit::Array::make(std::move(commands)));
  return toolkit::asArray(toolkit::readPropertyList(file).value);
}

void require(bool holds, const char* what) {
  if (holds) return;
  std::fprintf(stderr, "bench-running: %s\n", what);
  std::exit(1);
}

/// Returns the final state of the window, which must be the same for all contenders.
std::string captions(Stage& stage) {
  std::string all;
  for (const auto& view : stage.window->contentView()->subviews()) {
    const auto picture = stage.driver.look(view);
    all += picture.title.string() + "|" + picture.toolTip + (picture.enabled ? "+" : "-");
  }
  return all;
}

/// The time of one operation: as a command of this engine, called directly, and from Lua.
struct Times {
  double engine, direct, lua;
};

/// Returns how many rounds take about a second; with fewer controls a round is shorter.
int roundsOver(long controls) { return static_cast<int>(std::clamp(30000 / controls, 15L, 3000L)); }

Times timesOf(long controls, const std::vector<Operation>& operations) {
  Stage engineStage(controls), directStage(controls), luaStage(controls);
  const List list = listOf(operations);
  bench::LuaWalkthrough lua(*luaStage.window, operations);
  const auto id = Number::withLong(1);
  const auto times =
      bench::leastTimes({{"engine", [&] { engineStage.engine->processCommandArray(list, id); }},
                         {"direct", [&] { bench::runDirectly(directStage.window, operations); }},
                         {"Lua", [&] { lua.run(); }}},
                        roundsOver(controls));
  require(captions(engineStage) == captions(directStage), "direct calls came to something else");
  require(captions(engineStage) == captions(luaStage), "Lua came to something else");
  const auto count = static_cast<double>(operations.size());
  return {times[0] / count, times[1] / count, times[2] / count};
}

void printTimes(const std::string& what, const Times& times) {
  bench::printRow({what, bench::shownTime(times.engine), bench::shownTime(times.direct),
                   bench::shownTime(times.lua), bench::shownRatio(times.engine / times.direct),
                   bench::shownRatio(times.lua / times.engine)});
}

void printTimesHead(const std::string& title, const std::string& rows) {
  bench::printHead(title,
                   {rows, "this engine", "direct calls", "Lua 5.4", "this : direct", "Lua : this"});
}

constexpr std::size_t commandsMeasured = 600;

void measureLists() {
  printTimesHead("A command, of a list of all sorts", "controls");
  std::vector<std::pair<double, double>> points;
  for (const long controls : {10L, 100L, 1000L, 10000L}) {
    const Times times = timesOf(controls, operationsOver(controls, commandsMeasured));
    printTimes(std::to_string(controls), times);
    points.emplace_back(controls, times.engine);
  }
  bench::printExponent("Time grows with the number of controls", points);
}

void measureSorts() {
  constexpr long controls = 10;
  printTimesHead("A command, of a list of one sort, at 10 controls", "sort");
  for (const auto& [sort, name] : {std::pair{What::text, "text"},
                                   {What::title, "title"},
                                   {What::toolTip, "tooltip"},
                                   {What::enable, "enable"},
                                   {What::disable, "disable"},
                                   {What::stateOn, "state on"}}) {
    auto operations = operationsOver(controls, commandsMeasured);
    for (Operation& operation : operations) operation.what = sort;
    printTimes(name, timesOf(controls, operations));
  }
}

void measureListLength() {
  constexpr std::size_t lengths[] = {100, 1000, 10000, 100000};
  Stage stage(100);
  const auto id = Number::withLong(1);
  std::vector<bench::Contender> contenders;
  for (const std::size_t commands : lengths) {
    contenders.push_back(
        {std::to_string(commands), [&stage, &id, list = listOf(operationsOver(100, commands))] {
           stage.engine->processCommandArray(list, id);
         }});
  }
  const auto times = bench::leastTimes(contenders, 60);
  std::vector<std::pair<double, double>> points;
  for (std::size_t i = 0; i < times.size(); ++i) points.emplace_back(lengths[i], times[i]);
  bench::printExponent("Time grows with the length of the list, from 100 to 100000 commands,",
                       points);
}

/// Measures other work: a press of the last control, which runs the list of 10 commands under its
/// tag; a tick of the flasher with 10 flashing tags; discovery.
std::vector<double> timesOfEvents(long controls) {
  Stage stage(controls);
  const auto script = toolkit::Dictionary::make();
  script->setObject(listOf(operationsOver(controls, 10)), std::to_string(controls));
  stage.engine->setPlistDictionary(script);
  const auto last = stage.window->contentView()->subviews().back();
  stage.engine->setFlashing(true);
  for (toolkit::Tag tag = 1; tag <= 10; ++tag) {
    stage.engine->QZ_Plist_State_Processor_FLASH_ID(Number::withLong(tag), true);
  }
  return bench::leastTimes(
      {{"press", [&] { stage.driver.click(last); }},
       {"tick", [&] { stage.engine->flasherFired(stage.engine->flashingTimer()); }},
       {"discovery", [&] { stage.engine->getGuiAssetsFromWindow(stage.window); }}},
      controls > 1000 ? 15 : 100);
}

void measureEvents() {
  constexpr const char* events[] = {"a press, to the end of its list of 10 commands",
                                    "a tick of the flasher, 10 tags flashing",
                                    "discovery of the window"};
  std::vector<std::string> rows[std::size(events)];
  for (const long controls : {10L, 100L, 1000L, 10000L}) {
    const auto times = timesOfEvents(controls);
    for (std::size_t i = 0; i < times.size(); ++i) rows[i].push_back(bench::shownTime(times[i]));
  }
  bench::printHead("Other work, by the number of controls", {"", "10", "100", "1000", "10000"});
  for (std::size_t i = 0; i < std::size(events); ++i) {
    rows[i].insert(rows[i].begin(), events[i]);
    bench::printRow(rows[i]);
  }
}

}  // namespace

}  // namespace qz

using namespace qz;

int main() {
  measureLists();
  measureListLength();
  measureSorts();
  measureEvents();
  return 0;
}
